// SPDX-License-Identifier: MIT
// The columns of a file panel's list, and the row above it that names them.
#ifndef INTERFACE_PANEL_COLUMNS_H
#define INTERFACE_PANEL_COLUMNS_H

#include <View.h>

#include "interface/panel/FolderReader.h"

namespace BPrivate {

/// Where the columns are: x coordinates, pixels, in a list of some width.
struct PanelColumns {
	/// \a view: whose font counts.
	PanelColumns(const BView* view, float width);

	float icon;
	float name;
	float nameRight;
	/// Sizes end here.
	float sizeRight;
	float modified;
	float right;
};


/// Sent to the window for a click on a column: "order" (int32).
constexpr uint32 kMsgOrderChosen = '_POr';

/// Names the columns, and shows which one the list is ordered by.
class PanelHeader : public BView {
public:
	explicit PanelHeader(BRect frame);

	void SetOrder(FolderOrder order, bool descending);
	static float NeededHeight(const BView* view);

	void Draw(BRect updateRect) override;
	void MouseDown(BPoint where) override;

private:
	void DrawLabel(FolderOrder order, const char* label, float left, float right, bool atRight);

	FolderOrder fOrder;
	bool fDescending;
};

} // namespace BPrivate

#endif // INTERFACE_PANEL_COLUMNS_H
