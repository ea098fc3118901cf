// SPDX-License-Identifier: MIT
// BTab: one tab of a tab view, and its look.
#include <TabView.h>

#include <cmath>

#include <Message.h>
#include <Window.h>

#include "BarLook.h"

namespace {

// Between the tab's edges and its label.
constexpr float kLabelMargin = 6;

} // namespace

BTab::BTab(BView* contentsView)
	: fView(NULL),
	  fTabView(NULL),
	  fEnabled(true),
	  fSelected(false),
	  fFocus(false)
{
	SetContents(contentsView);
}


BTab::BTab(BMessage* archive)
	: BArchivable(archive),
	  fLabel(archive->GetString("_label", "")),
	  fView(NULL),
	  fTabView(NULL),
	  fEnabled(!archive->GetBool("_disable", false)),
	  fSelected(false),
	  fFocus(false)
{
	BMessage contents;
	if (archive->FindMessage("_view", &contents) != B_OK)
		return;
	BArchivable* object = instantiate_object(&contents);
	if (BView* view = dynamic_cast<BView*>(object))
		SetContents(view);
	else
		delete object;
}


BTab::~BTab()
{
	if (fView == NULL)
		return;
	fView->RemoveSelf();
	delete fView;
}


BArchivable*
BTab::Instantiate(BMessage* archive)
{
	return validate_instantiation(archive, "BTab") ? new BTab(archive) : NULL;
}


status_t
BTab::Archive(BMessage* archive, bool deep) const
{
	status_t status = BArchivable::Archive(archive, deep);
	if (status == B_OK && !fLabel.IsEmpty())
		status = archive->AddString("_label", fLabel);
	if (status == B_OK && !fEnabled)
		status = archive->AddBool("_disable", true);
	if (status != B_OK || !deep || fView == NULL)
		return status;
	BMessage contents;
	status = fView->Archive(&contents, true);
	return status == B_OK ? archive->AddMessage("_view", &contents) : status;
}


const char*
BTab::Label() const
{
	return fLabel.String();
}


void
BTab::SetLabel(const char* label)
{
	fLabel = label;
	if (fTabView != NULL)
		fTabView->TabChanged();
}


bool
BTab::IsSelected() const
{
	return fSelected;
}


void
BTab::Select(BView* owner)
{
	if (owner == NULL)
		return;
	if (fView != NULL && fView->Parent() == NULL && fView->Window() == NULL)
		owner->AddChild(fView);
	fSelected = true;
}


void
BTab::Deselect()
{
	if (fView != NULL)
		fView->RemoveSelf();
	fSelected = false;
}


void
BTab::SetEnabled(bool enable)
{
	if (enable == fEnabled)
		return;
	fEnabled = enable;
	if (fTabView != NULL)
		fTabView->TabChanged();
}


bool
BTab::IsEnabled() const
{
	return fEnabled;
}


void
BTab::MakeFocus(bool focus)
{
	fFocus = focus;
}


bool
BTab::IsFocus() const
{
	return fFocus;
}


void
BTab::SetView(BView* view)
{
	if (view == fView)
		return;
	if (fView != NULL) {
		fView->RemoveSelf();
		delete fView;
		fView = NULL;
	}
	SetContents(view);
	if (fSelected && fTabView != NULL)
		Select(fTabView->ContainerView());
}


BView*
BTab::View() const
{
	return fView;
}


void
BTab::DrawFocusMark(BView* owner, BRect frame)
{
	const float width = std::fmin(owner->StringWidth(Label()), frame.Width() - 2 * kLabelMargin);
	const float left = std::floor((frame.left + frame.right - width) / 2);
	owner->SetHighColor(ui_color(B_KEYBOARD_NAVIGATION_COLOR));
	owner->FillRect(BRect(left, frame.bottom - 4, left + std::ceil(width), frame.bottom - 3));
}


void
BTab::DrawLabel(BView* owner, BRect frame)
{
	BString label(fLabel);
	const float room = frame.Width() - 2 * kLabelMargin;
	// A fraction of a pixel that is missing cuts nothing.
	if (owner->StringWidth(label.String()) > room + 1)
		owner->TruncateString(&label, B_TRUNCATE_END, room);
	font_height height;
	owner->GetFontHeight(&height);
	const float width = owner->StringWidth(label.String());
	owner->SetHighColor(
		BPrivate::ControlTextColor(fEnabled, BPrivate::TabColor(owner, fSelected, fEnabled)));
	owner->SetDrawingMode(B_OP_OVER);
	owner->DrawString(label.String(),
		BPoint(std::floor((frame.left + frame.right - width) / 2 + 0.5f),
			std::floor((frame.top + frame.bottom + height.ascent - height.descent) / 2 + 0.5f)));
	owner->SetDrawingMode(B_OP_COPY);
}


void
BTab::DrawTab(BView* owner, BRect frame, tab_position position, bool)
{
	const BTabView* tabView = dynamic_cast<BTabView*>(owner);
	const BTabView::tab_side side = tabView != NULL ? tabView->TabSide() : BTabView::kTopSide;
	BPrivate::DrawTabSurface(owner, frame, side, position == B_TAB_FRONT, fEnabled);
	DrawLabel(owner, frame);
}


/// Takes over \a view; a tab without a label gets its name for one.
void
BTab::SetContents(BView* view)
{
	fView = view;
	if (view != NULL && fLabel.IsEmpty() && view->Name() != NULL)
		fLabel = view->Name();
}
