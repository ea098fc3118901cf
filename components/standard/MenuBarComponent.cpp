// SPDX-License-Identifier: MIT

#include "MenuBarComponent.h"

#include <Window.h>
#include <ormi/views/MenuItems.h>


namespace {

constexpr choice kBorders[] = {{"B_BORDER_FRAME", B_BORDER_FRAME},
	{"B_BORDER_CONTENTS", B_BORDER_CONTENTS}, {"B_BORDER_EACH_ITEM", B_BORDER_EACH_ITEM}};

constexpr property_row kProperties[] = {
	ShownBy<&BMenu::SetEnabled>("Enabled", "true"),
	ShownBy<&Ormi::MenuRow::SetItems>("Items", ""),
	ShownBy<&BMenuBar::SetBorder>("Border", "B_BORDER_FRAME", nullptr, kBorders),
	ResizingModeRow(),
};

constexpr event_row kEvents[] = {{"OnInvoke", "BMenuItem *item"}};
constexpr component_description kDescription = {
	"MenuBar", "TMenuBar", "MenuBar.h", kProperties, kEvents};

/// Does not become the menu bar of the window that it is designed in.
class DesignMenuBar : public DesignView<Ormi::MenuRow> {
public:
	using DesignView::DesignView;

	void AttachedToWindow() override
	{
		BMenuBar* windowBar = Window()->KeyMenuBar();
		DesignView::AttachedToWindow();
		Window()->SetKeyMenuBar(windowBar);
	}
};

} // namespace

TMenuBarComponent::TMenuBarComponent(TFormDesigner* designer, BRect frame)
	: TStandardComponent(designer, kDescription)
{
	SetDesignView(new DesignMenuBar(this, frame, "TMenuBar"));
}
