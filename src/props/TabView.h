// SPDX-License-Identifier: MIT
// A row of tabs, each with a page below.

#pragma once

#include <vector>

#include <String.h>
#include <View.h>

/// Tabs of equal width along the top edge, and below them one page at a time.
///
/// The pages are child views, placed by the caller in GetContentArea() and kept in place by their resizing
/// modes. Coordinates are the view's. Lock the window.
class TabView : public BView {
public:
	/// \a labels are copied, \a count of them; the first tab is selected. \a font also draws the labels.
	TabView(BRect frame, const char* name, const char** labels, long count, uint32 resizingMode,
		uint32 flags, const BFont* font);
	virtual ~TabView();

	/// Takes a page for each tab, in the order of the tabs, as children; only the selected one is shown.
	void AddViews(BView** views);

	/// Shows the page of that tab. An \a index that is selected already or out of range does nothing.
	virtual void SelectTab(long index);

	long SelectedTab() const { return fSelected; }

	/// Where the row of tabs ends: the right edge of the last one, plus 3.
	float GetTabsWidth() const;

	/// Where the pages lie, as it was when the view was made.
	BRect GetContentArea() const { return fContentArea; }

	// BView
	void Draw(BRect updateRect) override;
	void MouseDown(BPoint where) override;
	void KeyDown(const char* bytes, int32 numBytes) override;
	void MakeFocus(bool focus = true) override;
	void FrameResized(float width, float height) override;

private:
	struct tab_entry {
		BString label;
		BRect frame;
		BRect labelFrame;
		BPoint pen;
		BView* page;
	};

	void PlaceTabs();
	BRect DrawnFrame(const tab_entry& tab) const;
	void DrawTab(const tab_entry& tab);
	void DrawContentFrame(BRect updateRect);

	std::vector<tab_entry> fTabs;
	long fSelected;
	float fTabHeight;
	BRect fBounds;
	BRect fContentArea;
};
