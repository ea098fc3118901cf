// SPDX-License-Identifier: MIT
// BView: the tree of views, attaching and detaching, visibility and the hooks' base versions.
#include <View.h>

#include <cmath>
#include <cstdio>
#include <cstdlib>
#include <cstring>

#include <Message.h>
#include <Window.h>

#include "interface/ScrollBarLink.h"
#include "interface/ViewPrivate.h"
#include "interface/WindowPrivate.h"

namespace {

// The low half of the flags' word is the resizing mode.
const uint32 kResizingMask = 0xffff;

} // namespace


BView::BView(BRect frame, const char* name, uint32 resizingMode, uint32 flags)
	: BHandler(name),
	  fParent(nullptr),
	  fPreviousSibling(nullptr),
	  fNextSibling(nullptr),
	  fFirstChild(nullptr),
	  fLastChild(nullptr),
	  fOwner(nullptr),
	  fHorizontalBar(nullptr),
	  fVerticalBar(nullptr),
	  fLeftTop(std::round(frame.left), std::round(frame.top)),
	  fBounds(0, 0, std::round(frame.Width()), std::round(frame.Height())),
	  fFlags((resizingMode & kResizingMask) | (flags & ~kResizingMask)),
	  fViewColor{255, 255, 255, 255},
	  fViewTint(B_NO_TINT),
	  fViewUIColor(B_NO_COLOR),
	  fEventMask(0),
	  fEventOptions(0),
	  fMouseEventMask(0),
	  fMouseEventOptions(0),
	  fTopLevel(false),
	  fAttached(false),
	  fShowLevel(0)
{
}


BView::~BView()
{
	RemoveSelf();
	for (BPrivate::ScrollBarLink* bar : {fHorizontalBar, fVerticalBar}) {
		if (bar != nullptr)
			bar->TargetGone();
	}
	while (fFirstChild != nullptr)
		delete fFirstChild;
}


void
BView::AttachedToWindow()
{
}


void
BView::AllAttached()
{
}


void
BView::DetachedFromWindow()
{
}


void
BView::AllDetached()
{
}


void
BView::AddChild(BView* child, BView* before)
{
	CheckLock();
	if (child == nullptr || child == this)
		return;
	if (child->fParent != nullptr) {
		BPrivate::ReportMisuse("AddChild: the view already has a parent", child->Name());
		return;
	}
	if (before != nullptr && before->fParent != this) {
		BPrivate::ReportMisuse("AddChild: the view to put it before is no child", before->Name());
		return;
	}

	LinkChild(child, before);
	if (fOwner == nullptr)
		return;

	child->SetOwner(fOwner);
	child->CallAttachedHooks();
	// A hook may have taken the child out again.
	if (child->fParent == this)
		child->InvalidateFrame(child->Frame());
}


bool
BView::RemoveChild(BView* child)
{
	if (child == nullptr || child->fParent != this)
		return false;
	return child->RemoveSelf();
}


bool
BView::RemoveSelf()
{
	if (fParent == nullptr && !fTopLevel)
		return false;

	CheckLock();
	if (fOwner != nullptr) {
		InvalidateFrame(Frame());
		CallDetachedHooks();
	}
	if (fParent != nullptr)
		fParent->UnlinkChild(this);
	// Last: who waits for the looper of a menu may delete it from then on.
	if (fOwner != nullptr)
		ClearOwner();
	return true;
}


int32
BView::CountChildren() const
{
	CheckLock();
	int32 count = 0;
	for (BView* child = fFirstChild; child != nullptr; child = child->fNextSibling)
		count++;
	return count;
}


BView*
BView::ChildAt(int32 index) const
{
	CheckLock();
	if (index < 0)
		return nullptr;

	BView* child = fFirstChild;
	while (child != nullptr && index-- > 0)
		child = child->fNextSibling;
	return child;
}


BView*
BView::NextSibling() const
{
	CheckLock();
	return fNextSibling;
}


BView*
BView::PreviousSibling() const
{
	CheckLock();
	return fPreviousSibling;
}


BWindow*
BView::Window() const
{
	return fOwner;
}


BView*
BView::Parent() const
{
	if (fParent != nullptr && fParent->fTopLevel)
		return nullptr;
	return fParent;
}


BView*
BView::FindView(const char* name) const
{
	if (name == nullptr)
		return nullptr;
	if (Name() != nullptr && std::strcmp(Name(), name) == 0)
		return const_cast<BView*>(this);

	for (BView* child = fFirstChild; child != nullptr; child = child->fNextSibling) {
		if (BView* found = child->FindView(name))
			return found;
	}
	return nullptr;
}


void
BView::SetFlags(uint32 flags)
{
	CheckLock();
	uint32 newFlags = (flags & ~kResizingMask) | (fFlags & kResizingMask);
	uint32 changed = fFlags ^ newFlags;
	fFlags = newFlags;
	if (fOwner != nullptr && (changed & (B_DRAW_ON_CHILDREN | B_TRANSPARENT_BACKGROUND)) != 0)
		fOwner->fData->painter.ClippingChanged();
	if (fOwner != nullptr && (changed & B_PULSE_NEEDED) != 0)
		fOwner->fData->UpdatePulse();
}


uint32
BView::Flags() const
{
	return fFlags & ~kResizingMask;
}


void
BView::SetResizingMode(uint32 mode)
{
	CheckLock();
	fFlags = (fFlags & ~kResizingMask) | (mode & kResizingMask);
}


uint32
BView::ResizingMode() const
{
	return fFlags & kResizingMask;
}


void
BView::Show()
{
	CheckLock();
	fShowLevel--;
	if (fShowLevel == 0 && fOwner != nullptr)
		InvalidateFrame(Frame());
}


void
BView::Hide()
{
	CheckLock();
	fShowLevel++;
	if (fShowLevel == 1 && fOwner != nullptr)
		InvalidateFrame(Frame());
}


bool
BView::IsHidden() const
{
	return IsHidden(nullptr);
}


bool
BView::IsHidden(const BView* looking_from) const
{
	if (fShowLevel > 0)
		return true;
	if (looking_from == this)
		return false;
	if (fParent != nullptr)
		return fParent->IsHidden(looking_from);
	return fOwner != nullptr && looking_from == nullptr && fOwner->IsHidden();
}


void
BView::MakeFocus(bool focus)
{
	if (fOwner == nullptr)
		return;

	CheckLock();
	BView* current = fOwner->CurrentFocus();
	if (!focus) {
		if (current == this)
			fOwner->SetFocus(nullptr);
		return;
	}
	if (current != nullptr && current != this)
		current->MakeFocus(false);
	fOwner->SetFocus(this);
}


bool
BView::IsFocus() const
{
	return fOwner != nullptr && fOwner->CurrentFocus() == this;
}


void
BView::GetPreferredSize(float* _width, float* _height)
{
	if (_width != nullptr)
		*_width = fBounds.Width();
	if (_height != nullptr)
		*_height = fBounds.Height();
}


void
BView::ResizeToPreferred()
{
	float width, height;
	GetPreferredSize(&width, &height);
	ResizeTo(width, height);
}


BScrollBar*
BView::ScrollBar(orientation direction) const
{
	BPrivate::ScrollBarLink* bar = direction == B_HORIZONTAL ? fHorizontalBar : fVerticalBar;
	return bar != nullptr ? bar->ScrollBar() : nullptr;
}


void
BView::SetScrollBar(orientation direction, BPrivate::ScrollBarLink* bar)
{
	(direction == B_HORIZONTAL ? fHorizontalBar : fVerticalBar) = bar;
}


void
BView::Draw(BRect)
{
}


void
BView::DrawAfterChildren(BRect)
{
}


void
BView::WindowActivated(bool)
{
}


void
BView::Pulse()
{
}


void
BView::FrameMoved(BPoint)
{
}


void
BView::FrameResized(float, float)
{
}


void
BView::TargetedByScrollView(BScrollView*)
{
}


void
BView::LinkChild(BView* child, BView* before)
{
	child->fParent = this;
	child->fNextSibling = before;
	child->fPreviousSibling = before != nullptr ? before->fPreviousSibling : fLastChild;
	(child->fPreviousSibling != nullptr ? child->fPreviousSibling->fNextSibling : fFirstChild) =
		child;
	(before != nullptr ? before->fPreviousSibling : fLastChild) = child;
}


void
BView::UnlinkChild(BView* child)
{
	(child->fPreviousSibling != nullptr ? child->fPreviousSibling->fNextSibling : fFirstChild) =
		child->fNextSibling;
	(child->fNextSibling != nullptr ? child->fNextSibling->fPreviousSibling : fLastChild) =
		child->fPreviousSibling;
	child->fParent = nullptr;
	child->fPreviousSibling = nullptr;
	child->fNextSibling = nullptr;
}


void
BView::SetOwner(BWindow* window)
{
	fOwner = window;
	window->AddHandler(this);
	SetNextHandler(
		fParent == nullptr || fParent->fTopLevel ? static_cast<BHandler*>(window) : fParent);
	window->fData->ViewAdded(this);

	for (BView* child = fFirstChild; child != nullptr; child = child->fNextSibling)
		child->SetOwner(window);
}


void
BView::ClearOwner()
{
	for (BView* child = fFirstChild; child != nullptr; child = child->fNextSibling)
		child->ClearOwner();
	BWindow* window = fOwner;
	window->fData->ViewRemoved(this);
	fOwner = nullptr;
	window->RemoveHandler(this);
}


// Views that a hook adds are attached by that AddChild() and skipped here. As a hook may also remove
// siblings, the walk starts again from the first child when it lost its place.
void
BView::CallAttachedHooks()
{
	AttachedToWindow();
	fAttached = true;

	BView* child = fFirstChild;
	while (child != nullptr && fOwner != nullptr) {
		if (!child->fAttached) {
			child->CallAttachedHooks();
			if (child->fParent != this) {
				child = fFirstChild;
				continue;
			}
		}
		child = child->fNextSibling;
	}
	if (fOwner != nullptr)
		AllAttached();
}


void
BView::CallDetachedHooks()
{
	DetachedFromWindow();
	fAttached = false;

	BView* child = fFirstChild;
	while (child != nullptr) {
		BView* next = child->fNextSibling;
		if (child->fAttached)
			child->CallDetachedHooks();
		child = next;
	}
	AllDetached();

	// The hooks may be overridden without a call of the base: what points here goes in any case.
	fOwner->ViewDetached(this);
}


void
BView::CheckLock() const
{
#ifndef NDEBUG
	if (fOwner != nullptr && !fOwner->IsLocked())
		BPrivate::ReportMisuse("a view was used without its window's lock", Name());
#endif
}
