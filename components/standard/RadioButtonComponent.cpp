// SPDX-License-Identifier: MIT

#include "RadioButtonComponent.h"

#include <RadioButton.h>


namespace {

/// Shows at most one radio button of a container as on, without changing what the others are set to.
class DesignRadioButton : public DesignView<BRadioButton> {
public:
	using DesignView::DesignView;

	void SetChecked(bool checked)
	{
		fIsChecked = checked;
		ShowGroup(Parent(), nullptr);
	}

	void AttachedToWindow() override
	{
		DesignView::AttachedToWindow();
		if (fIsChecked)
			ShowGroup(Parent(), nullptr);
	}

	void DetachedFromWindow() override
	{
		DesignView::DetachedFromWindow();
		if (fIsChecked)
			ShowGroup(Parent(), this);
	}

private:
	/// Without \a leaving, which may be null.
	void ShowGroup(BView* parent, const DesignRadioButton* leaving)
	{
		BView* first = parent != nullptr ? parent->ChildAt(0) : this;
		DesignRadioButton* last = nullptr;
		for (BView* child = first; child != nullptr; child = child->NextSibling()) {
			DesignRadioButton* button = dynamic_cast<DesignRadioButton*>(child);
			if (button == nullptr || button == leaving)
				continue;
			button->SetValue(B_CONTROL_OFF);
			if (button->fIsChecked)
				last = button;
		}
		// Turns those beside it off.
		if (last != nullptr)
			last->SetValue(B_CONTROL_ON);
	}

	bool fIsChecked = false;
};

constexpr property_row kProperties[] = {
	ShownBy<&DesignRadioButton::SetChecked>("Checked", "false", "$COMPONENT->SetValue($VALUE);"),
};

constexpr event_row kEvents[] = {{"OnChange", nullptr}};
constexpr const char* kParameters[] = {"Label"};
constexpr component_description kDescription = {
	"RadioButton", "TRadioButton", "RadioButton.h", kProperties, kEvents, kParameters};

} // namespace

TRadioButtonComponent::TRadioButtonComponent(TFormDesigner* designer, BRect frame)
	: TStandardComponent(designer, kDescription)
{
	SetDesignView(new DesignRadioButton(this, frame, "TRadioButton", "", nullptr));
}
