// SPDX-License-Identifier: MIT
// Several views in one place, chosen by tabs.
#ifndef _TAB_VIEW_H
#define _TAB_VIEW_H

#include <List.h>
#include <String.h>
#include <View.h>

class BTabView;

enum tab_position {
	B_TAB_FIRST = 999,
	B_TAB_FRONT = 1000,
	B_TAB_ANY = 1001,
};

/// A tab of a tab view, with the view that it stands for.
class BTab : public BArchivable {
public:
	/// Takes over \a contentsView, whose name is the first label.
	BTab(BView* contentsView = NULL);
	BTab(BMessage* archive);
	/// Deletes the view.
	virtual ~BTab();

	static BArchivable* Instantiate(BMessage* archive);
	status_t Archive(BMessage* archive, bool deep = true) const override;

	/// "" for none.
	const char* Label() const;
	/// Copied; null for none.
	virtual void SetLabel(const char* label);

	bool IsSelected() const;
	/// Adds the view to \a owner, the container view. Called by the tab view.
	virtual void Select(BView* owner);
	/// Takes the view out again.
	virtual void Deselect();

	/// The user cannot select a disabled tab.
	virtual void SetEnabled(bool enable);
	bool IsEnabled() const;

	/// Only marks it; BTabView::SetFocusTab() moves the mark.
	void MakeFocus(bool focus = true);
	bool IsFocus() const;

	/// Deletes the view so far and takes over \a view, which is shown in place of it.
	virtual void SetView(BView* view);
	BView* View() const;

	/// \a owner is the tab view, which draws; \a frame is in its coordinates.
	virtual void DrawFocusMark(BView* owner, BRect frame);
	virtual void DrawLabel(BView* owner, BRect frame);
	virtual void DrawTab(BView* owner, BRect frame, tab_position position, bool full = true);

private:
	friend class BTabView;

	void SetContents(BView* view);

	BString fLabel;
	BView* fView;
	BTabView* fTabView;
	BRect fContainerSize;
	float fLabelWidth = 0;
	bool fEnabled;
	bool fSelected;
	bool fFocus;
};


/// A row of tabs and a container in which the selected one's view lies, at its own frame.
///
/// Only the selected tab's view is attached. Tabs that do not fit are reached by two arrows at the end
/// of the row. With the focus, the arrow keys select the next enabled tab, Home and End the outer ones.
class BTabView : public BView {
public:
	enum tab_side {
		kLeftSide = 1,
		kRightSide = 2,
		kTopSide = 4,
		kBottomSide = 8,
	};

	BTabView(const char* name, button_width width = B_WIDTH_FROM_WIDEST,
		uint32 flags = B_FULL_UPDATE_ON_RESIZE | B_WILL_DRAW | B_NAVIGABLE_JUMP | B_FRAME_EVENTS
			| B_NAVIGABLE);
	BTabView(BRect frame, const char* name, button_width width = B_WIDTH_AS_USUAL,
		uint32 resizeMask = B_FOLLOW_ALL,
		uint32 flags = B_FULL_UPDATE_ON_RESIZE | B_WILL_DRAW | B_NAVIGABLE_JUMP | B_FRAME_EVENTS
			| B_NAVIGABLE);
	BTabView(BMessage* archive);
	/// Deletes the tabs and their views.
	virtual ~BTabView();

	static BArchivable* Instantiate(BMessage* archive);
	status_t Archive(BMessage* archive, bool deep = true) const override;

	void AttachedToWindow() override;
	void KeyDown(const char* bytes, int32 numBytes) override;
	void MouseDown(BPoint where) override;
	void WindowActivated(bool active) override;
	void MakeFocus(bool focus = true) override;
	void Draw(BRect updateRect) override;
	void FrameResized(float newWidth, float newHeight) override;
	void GetPreferredSize(float* _width, float* _height) override;
	void SetFont(const BFont* font, uint32 mask = B_FONT_ALL) override;

	/// Called for each change of the selection, also by the user. Ignored out of range; sends nothing.
	virtual void Select(int32 index);
	/// -1 for none: the first tab is selected when the view is attached.
	int32 Selection() const;
	/// The tab that the keys work on; \a focused: whether it gets or loses that.
	virtual void SetFocusTab(int32 tab, bool focused);
	/// -1 for none.
	int32 FocusTab() const;

	/// Draws the tabs; the frame of the selected one.
	virtual BRect DrawTabs();
	/// Draws the border round the container, open at \a selectedTabRect.
	virtual void DrawBox(BRect selectedTabRect);
	/// In the tab view's coordinates. Invalid for no tab and for one that is scrolled out.
	virtual BRect TabFrame(int32 index) const;

	/// Takes over both. Null for \a tab makes one labelled with the view's name.
	virtual void AddTab(BView* target, BTab* tab = NULL);
	/// The tab is the caller's; null when there is none. The one before it is selected in its place.
	virtual BTab* RemoveTab(int32 tabIndex);
	/// Null when there is none.
	virtual BTab* TabAt(int32 index) const;

	/// All tabs as wide as usual, as the widest label needs, or each as its own label needs.
	virtual void SetTabWidth(button_width width);
	button_width TabWidth() const;
	virtual void SetTabHeight(float height);
	float TabHeight() const;
	virtual void SetBorder(border_style borderStyle);
	border_style Border() const;
	virtual void SetTabSide(tab_side tabSide);
	tab_side TabSide() const;

	BView* ContainerView() const;
	int32 CountTabs() const;
	BView* ViewForTab(int32 tabIndex) const;
	/// -1 for a tab of another view.
	int32 IndexOf(BTab* tab) const;

private:
	friend class BTab;

	void Init(button_width width);
	void TabChanged();
	void Deselect();
	void AttachContents(BTab* tab);
	void SelectByKey(int32 index);
	int32 NextEnabledTab(int32 from, int32 step) const;
	void Redraw();

	void LayOutContainer();
	bool IsSideways() const;
	float BorderWidth() const;
	float DefaultTabHeight() const;
	float WidthOfTab(int32 index) const;
	void MeasureLabels();
	float StripThickness() const;
	float LengthOfTab(int32 index) const;
	float LengthOfStrip() const;
	BRect StripFrame() const;
	BRect BoxFrame() const;
	bool NeedsArrows() const;
	float RoomForTabs() const;
	BRect ArrowFrame(int32 direction) const;
	int32 LastFirstTab() const;
	void ScrollTabs(int32 direction);
	void ShowTab(int32 index);
	void DrawFocus(int32 index, BRect frame);

	BList fTabs;
	BView* fContainer = NULL;
	button_width fTabWidth;
	float fTabHeight;
	tab_side fTabSide;
	border_style fBorder;
	int32 fSelection;
	int32 fFocusTab;
	int32 fFirstTab;
	float fWidestLabel;
};

#endif // _TAB_VIEW_H
