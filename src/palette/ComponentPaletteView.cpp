// SPDX-License-Identifier: MIT

#include "palette/ComponentPaletteView.h"

#include <algorithm>

#include <Message.h>
#include <ScrollBar.h>

#include "palette/ComponentPalette.h"
#include "palette/PaletteCatalog.h"
#include "palette/PaletteEntry.h"

namespace {

// The height of a button, which one turn of the scroll bar's arrow shows more of.
constexpr float kScrollStep = 24;

} // namespace


ComponentPaletteView::ComponentPaletteView(BRect frame, const char* name)
	: BBox(frame, name, B_FOLLOW_ALL_SIDES, B_WILL_DRAW | B_FRAME_EVENTS, B_FANCY_BORDER),
	  fColumnHeight(0)
{
}


ComponentPaletteView::~ComponentPaletteView() = default;


void
ComponentPaletteView::AddPalEntry(TPaletteEntry* entry)
{
	PaletteCatalog().AddPalEntry(entry);
}


TPaletteEntry*
ComponentPaletteView::FindPalEntry(const char* className) const
{
	return PaletteCatalog().FindPalEntry(className);
}


void
ComponentPaletteView::SetColumnHeight(float height)
{
	fColumnHeight = height;
	UpdateScrollBar();
}


void
ComponentPaletteView::MessageReceived(BMessage* message)
{
	message->PrintToStream();
	switch (message->what) {
		case B_SIMPLE_DATA:
			if (!message->HasRef("refs"))
				BBox::MessageReceived(message);
			break;

		case kPaletteEntryPressed:
		{
			void* entry;
			ComponentPalette* palette = dynamic_cast<ComponentPalette*>(Window());
			if (palette != nullptr && message->FindPointer("palEntry", &entry) == B_OK)
				palette->SetDropEntry(static_cast<TPaletteEntry*>(entry));
			break;
		}

		default:
			BBox::MessageReceived(message);
			break;
	}
}


void
ComponentPaletteView::FrameResized(float width, float height)
{
	BBox::FrameResized(width, height);
	UpdateScrollBar();
	Invalidate();
}


void
ComponentPaletteView::UpdateScrollBar()
{
	BScrollBar* bar = ScrollBar(B_VERTICAL);
	if (bar == nullptr)
		return;

	const float height = Bounds().Height();
	bar->SetRange(0, std::max(0.0f, fColumnHeight - height));
	bar->SetProportion(fColumnHeight > height ? height / fColumnHeight : 1);
	bar->SetSteps(kScrollStep, std::max(kScrollStep, height - kScrollStep));
}
