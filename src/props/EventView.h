// SPDX-License-Identifier: MIT
// The property window's page of events.

#pragma once

#include <View.h>

class BListView;
struct TComponentRows;

/// The list of a component's events. Lock the window.
class TEventView : public BView {
public:
	explicit TEventView(BRect frame);
	virtual ~TEventView();

	/// Takes the event rows of \a rows in place of those so far; none is selected.
	void SetRows(TComponentRows* rows);

	/// Shows \a rows in the rows there are, or in their place when there are more or fewer. The selection stays.
	void UpdateRows(TComponentRows* rows);

	void ClearItems();

	BListView* List() const { return fList; }

private:
	BListView* fList;
};
