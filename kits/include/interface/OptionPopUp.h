// SPDX-License-Identifier: MIT
// Options that are chosen from a menu.
#ifndef _OPTION_POP_UP_H
#define _OPTION_POP_UP_H

#include <OptionControl.h>

class BMenuField;

/// A menu field of named values. The first option is chosen until another one is.
///
/// A choice of the user sends the message with the option's number as "be:value".
class BOptionPopUp : public BOptionControl {
public:
	BOptionPopUp(BRect frame, const char* name, const char* label, BMessage* message,
		uint32 resizeMask = B_FOLLOW_LEFT_TOP, uint32 flags = B_WILL_DRAW);
	/// \a fixed: the field fills the frame right of the label; else it is as wide as the longest option.
	BOptionPopUp(BRect frame, const char* name, const char* label, BMessage* message, bool fixed,
		uint32 resizeMask = B_FOLLOW_LEFT_TOP, uint32 flags = B_WILL_DRAW);
	BOptionPopUp(
		const char* name, const char* label, BMessage* message, uint32 flags = B_WILL_DRAW);
	virtual ~BOptionPopUp();

	void AttachedToWindow() override;
	void AllAttached() override;
	void MessageReceived(BMessage* message) override;
	void GetPreferredSize(float* _width, float* _height) override;
	void ResizeToPreferred() override;

	/// The field inside.
	BMenuField* MenuField();

	bool GetOptionAt(int32 index, const char** _name, int32* _value) override;
	void RemoveOptionAt(int32 index) override;
	int32 CountOptions() const override;
	status_t AddOptionAt(const char* name, int32 value, int32 index) override;
	int32 SelectedOption(const char** name = NULL, int32* outValue = NULL) const override;

	void SetLabel(const char* label) override;
	/// Chooses the first option with that value; none is chosen when there is none.
	void SetValue(int32 value) override;
	void SetEnabled(bool enabled) override;

private:
	void PlaceField();

	BMenuField* fMenuField;
};

#endif // _OPTION_POP_UP_H
