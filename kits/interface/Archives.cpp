// SPDX-License-Identifier: MIT
// Views and windows in messages: their fields as the platform names them.
#include <Message.h>
#include <View.h>
#include <Window.h>

#include "interface/ArchivedEnum.h"
#include "interface/ViewPrivate.h"
#include "interface/WindowPrivate.h"

using BPrivate::EnumAmong;
using BPrivate::EnumBetween;

namespace {

// The views of an archive; objects that are none are thrown away.
template <typename Parent>
void
AddArchivedViews(BMessage* archive, Parent* parent)
{
	BMessage child;
	for (int32 i = 0; archive->FindMessage("_views", i, &child) == B_OK; i++) {
		BArchivable* object = instantiate_object(&child);
		if (BView* view = dynamic_cast<BView*>(object))
			parent->AddChild(view);
		else
			delete object;
	}
}


template <typename Parent>
status_t
ArchiveViews(const Parent* parent, BMessage* archive)
{
	status_t status = B_OK;
	int32 count = parent->CountChildren();
	for (int32 i = 0; status == B_OK && i < count; i++) {
		BMessage child;
		status = parent->ChildAt(i)->Archive(&child, true);
		if (status == B_OK)
			status = archive->AddMessage("_views", &child);
	}
	return status;
}


window_look
LookIn(const BMessage& archive)
{
	return EnumAmong(archive.GetInt32("_wlook", B_TITLED_WINDOW_LOOK),
		{B_BORDERED_WINDOW_LOOK, B_NO_BORDER_WINDOW_LOOK, B_TITLED_WINDOW_LOOK,
			B_DOCUMENT_WINDOW_LOOK, B_MODAL_WINDOW_LOOK, B_FLOATING_WINDOW_LOOK},
		B_TITLED_WINDOW_LOOK);
}

} // namespace


BView::BView(BMessage* archive)
	: BView(archive->GetRect("_frame", BRect()), archive->GetString("_name"),
		archive->GetInt32("_resize_mode", B_FOLLOW_LEFT_TOP), archive->GetInt32("_flags", 0))
{
	fEventMask = static_cast<uint8>(archive->GetInt32("_evmask", 0));
	fEventOptions = static_cast<uint8>(archive->GetInt32("_evmask", 1, 0));
	fShowLevel = archive->GetInt16("_show", 0);

	rgb_color color;
	if (archive->FindColor("_color", 0, &color) == B_OK)
		Drawing().state.highColor = color;
	if (archive->FindColor("_color", 1, &color) == B_OK)
		Drawing().state.lowColor = color;
	if (archive->FindColor("_color", 2, &color) == B_OK)
		fViewColor = color;
	BPoint origin;
	if (archive->FindPoint("_origin", &origin) == B_OK)
		Drawing().state.origin = origin;
	float penSize;
	if (archive->FindFloat("_psize", &penSize) == B_OK)
		Drawing().state.penSize = penSize;
	int32 mode;
	if (archive->FindInt32("_dmod", &mode) == B_OK)
		Drawing().state.mode = EnumBetween(mode, B_OP_COPY, B_OP_ALPHA, B_OP_COPY);
	const char* family;
	const char* style;
	if (archive->FindString("_fname", 0, &family) == B_OK
		&& archive->FindString("_fname", 1, &style) == B_OK)
		Drawing().state.font.SetFamilyAndStyle(family, style);
	float size;
	if (archive->FindFloat("_fflt", 0, &size) == B_OK)
		Drawing().state.font.SetSize(size);

	AddArchivedViews(archive, this);
}


BArchivable*
BView::Instantiate(BMessage* archive)
{
	return validate_instantiation(archive, "BView") ? new BView(archive) : nullptr;
}


status_t
BView::Archive(BMessage* archive, bool deep) const
{
	status_t status = BHandler::Archive(archive, deep);
	if (status != B_OK)
		return status;

	archive->AddRect("_frame", Frame());
	archive->AddInt32("_resize_mode", ResizingMode());
	archive->AddInt32("_flags", Flags());
	if (fEventMask != 0) {
		archive->AddInt32("_evmask", fEventMask);
		archive->AddInt32("_evmask", fEventOptions);
	}
	if (fShowLevel > 0)
		archive->AddInt16("_show", fShowLevel);
	archive->AddColor("_color", HighColor());
	archive->AddColor("_color", LowColor());
	status = archive->AddColor("_color", ViewColor());

	if (fDrawing != nullptr) {
		const BPrivate::GraphicsState& state = fDrawing->state;
		archive->AddPoint("_origin", state.origin);
		archive->AddFloat("_psize", state.penSize);
		archive->AddInt32("_dmod", state.mode);
		if (state.font != *be_plain_font) {
			font_family family;
			font_style style;
			state.font.GetFamilyAndStyle(&family, &style);
			archive->AddString("_fname", family);
			archive->AddString("_fname", style);
			status = archive->AddFloat("_fflt", state.font.Size());
		}
	}
	return status == B_OK && deep ? ArchiveViews(this, archive) : status;
}


BWindow::BWindow(BMessage* archive)
	: BWindow(archive->GetRect("_frame", BRect()), archive->GetString("_title", ""),
		LookIn(*archive),
		EnumBetween(archive->GetInt32("_wfeel", B_NORMAL_WINDOW_FEEL), B_NORMAL_WINDOW_FEEL,
			B_FLOATING_ALL_WINDOW_FEEL, B_NORMAL_WINDOW_FEEL),
		archive->GetInt32("_flags", 0), archive->GetInt32("_wspace", B_CURRENT_WORKSPACE))
{
	float limits[4];
	bool hasLimits = true;
	for (int32 i = 0; i < 4; i++)
		hasLimits = archive->FindFloat("_sizel", i, &limits[i]) == B_OK && hasLimits;
	if (hasLimits)
		SetSizeLimits(limits[0], limits[1], limits[2], limits[3]);
	float zoomWidth, zoomHeight;
	if (archive->FindFloat("_zoom", 0, &zoomWidth) == B_OK
		&& archive->FindFloat("_zoom", 1, &zoomHeight) == B_OK)
		SetZoomLimits(zoomWidth, zoomHeight);
	SetPulseRate(archive->GetInt64("_pulse", PulseRate()));
	AddArchivedViews(archive, this);
}


BArchivable*
BWindow::Instantiate(BMessage* archive)
{
	return validate_instantiation(archive, "BWindow") ? new BWindow(archive) : nullptr;
}


status_t
BWindow::Archive(BMessage* archive, bool deep) const
{
	status_t status = BLooper::Archive(archive, deep);
	if (status != B_OK)
		return status;

	archive->AddRect("_frame", fData->frame);
	archive->AddString("_title", fData->title.c_str());
	archive->AddInt32("_wlook", fData->look);
	archive->AddInt32("_wfeel", fData->feel);
	archive->AddInt32("_flags", fData->flags);
	archive->AddInt32("_wspace", fData->workspaces);
	for (float limit : {fData->minWidth, fData->maxWidth, fData->minHeight, fData->maxHeight})
		archive->AddFloat("_sizel", limit);
	archive->AddFloat("_zoom", fData->maxZoomWidth);
	archive->AddFloat("_zoom", fData->maxZoomHeight);
	status = archive->AddInt64("_pulse", fData->pulseRate);
	return status == B_OK && deep ? ArchiveViews(this, archive) : status;
}
