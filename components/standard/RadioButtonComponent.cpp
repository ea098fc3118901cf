// SPDX-License-Identifier: MIT

#include "RadioButtonComponent.h"

#include <RadioButton.h>

#include "DesignView.h"

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
		ShowGroup(Parent(), nullptr);
	}

	void DetachedFromWindow() override
	{
		DesignView::DetachedFromWindow();
		ShowGroup(Parent(), this);
	}

private:
	/// Without \a leaving, which may be null.
	void ShowGroup(BView* parent, const DesignRadioButton* leaving)
	{
		if (parent == nullptr) {
			BControl::SetValue(fIsChecked ? B_CONTROL_ON : B_CONTROL_OFF);
			return;
		}
		bool isFound = false;
		for (int32 i = parent->CountChildren() - 1; i >= 0; i--) {
			DesignRadioButton* button = dynamic_cast<DesignRadioButton*>(parent->ChildAt(i));
			if (button == nullptr || button == leaving)
				continue;
			const bool isOn = button->fIsChecked && !isFound;
			isFound = isFound || isOn;
			button->BControl::SetValue(isOn ? B_CONTROL_ON : B_CONTROL_OFF);
		}
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
