// SPDX-License-Identifier: MIT
// A row of the property window's list of events.

#pragma once

#include <ListItem.h>

struct TEvent;

/// An event's name, and a mark when the user wants a handler. The event is not owned.
class TEventListItem : public BListItem {
public:
	/// The middle of the mark, in pixels left of the row's right edge.
	static constexpr float kMarkFromRight = 67;

	/// \a event: its component's form is locked.
	explicit TEventListItem(TEvent* event);
	virtual ~TEventListItem();

	/// Null after Clear().
	TEvent* Event() const { return fEvent; }

	void Clear() { fEvent = nullptr; }

	/// Takes over what \a fresh shows. True when that is something else.
	bool TakeOver(const TEventListItem& fresh);

	const char* Name() const { return fName; }
	bool IsMarked() const { return fMarked; }

	// BListItem
	void DrawItem(BView* owner, BRect frame, bool complete = false) override;

private:
	TEvent* fEvent;
	const char* fName; // a constant of the program or of a library that stays loaded
	bool fMarked;
};
