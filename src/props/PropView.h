// SPDX-License-Identifier: MIT
// The property window's page of properties.

#pragma once

#include <View.h>

class BListView;
struct TComponentRows;

/// The list of a component's properties, and below it a strip for the editor panes. Lock the window.
class TPropView : public BView {
public:
	explicit TPropView(BRect frame);
	virtual ~TPropView();

	/// Takes the property rows of \a rows in place of those so far, and selects the first.
	void SetRows(TComponentRows* rows);

	/// Shows \a rows in the rows there are, or in their place when there are more or fewer. The selection stays.
	void UpdateRows(TComponentRows* rows);

	void ClearItems();

	BListView* List() const { return fList; }

	/// Where the editor panes lie: 30 pixels high at the bottom.
	BRect PaneFrame() const;

	// BView
	void FrameResized(float width, float height) override;

private:
	BListView* fList;
};
