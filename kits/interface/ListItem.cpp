// SPDX-License-Identifier: MIT

#include <ListItem.h>

#include <algorithm>
#include <cmath>

#include <Message.h>
#include <View.h>

BListItem::BListItem(uint32 outlineLevel, bool expanded)
	: fStamp(0),
	  fTop(0),
	  fRowHeight(0),
	  fHeight(0),
	  fWidth(0),
	  fLevel(outlineLevel),
	  fSelected(false),
	  fEnabled(true),
	  fExpanded(expanded),
	  fHasSubitems(false),
	  fVisible(false)
{
}


BListItem::BListItem(BMessage* archive)
	: BArchivable(archive),
	  fStamp(0),
	  fTop(0),
	  fRowHeight(0),
	  fHeight(0),
	  fWidth(0),
	  fLevel(static_cast<uint32>(archive->GetInt32("_li_outline_level", 0))),
	  fSelected(archive->GetBool("_sel", false)),
	  fEnabled(!archive->GetBool("_disable", false)),
	  fExpanded(archive->GetBool("_li_expanded", true)),
	  fHasSubitems(false),
	  fVisible(false)
{
}


BListItem::~BListItem() {}


BArchivable*
BListItem::Instantiate(BMessage*)
{
	// There is no plain item.
	return NULL;
}


status_t
BListItem::Archive(BMessage* archive, bool deep) const
{
	status_t status = BArchivable::Archive(archive, deep);
	if (status == B_OK && fSelected)
		status = archive->AddBool("_sel", true);
	if (status == B_OK && !fEnabled)
		status = archive->AddBool("_disable", true);
	if (status == B_OK && !fExpanded)
		status = archive->AddBool("_li_expanded", false);
	if (status == B_OK && fLevel != 0)
		status = archive->AddInt32("_li_outline_level", static_cast<int32>(fLevel));
	return status;
}


float
BListItem::Height() const
{
	return fHeight;
}


float
BListItem::Width() const
{
	return fWidth;
}


void
BListItem::SetHeight(float height)
{
	fHeight = height;
}


void
BListItem::SetWidth(float width)
{
	fWidth = width;
}


bool
BListItem::IsSelected() const
{
	return fSelected;
}


void
BListItem::Select()
{
	fSelected = true;
}


void
BListItem::Deselect()
{
	fSelected = false;
}


void
BListItem::SetEnabled(bool enabled)
{
	fEnabled = enabled;
}


bool
BListItem::IsEnabled() const
{
	return fEnabled;
}


void
BListItem::Update(BView* owner, const BFont* font)
{
	font_height height;
	font->GetHeight(&height);
	SetWidth(owner->Bounds().Width());
	SetHeight(std::ceil(height.ascent + height.descent + height.leading));
}


bool
BListItem::IsExpanded() const
{
	return fExpanded;
}


void
BListItem::SetExpanded(bool expanded)
{
	fExpanded = expanded;
}


uint32
BListItem::OutlineLevel() const
{
	return fLevel;
}


void
BListItem::SetOutlineLevel(uint32 level)
{
	fLevel = level;
}
