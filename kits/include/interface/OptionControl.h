// SPDX-License-Identifier: MIT
// The base of controls that choose one of several named values.
#ifndef _OPTION_CONTROL_H
#define _OPTION_CONTROL_H

#include <Control.h>

enum {
	/// "be:value" (int32): sent to an option control, it takes that value and sends its own message.
	B_OPTION_CONTROL_VALUE = '_BMV',
};

/// A control with options, each of a name and a number. Its value is the number of the chosen one.
class BOptionControl : public BControl {
public:
	BOptionControl(BRect frame, const char* name, const char* label, BMessage* message,
		uint32 resizeMask = B_FOLLOW_LEFT_TOP, uint32 flags = B_WILL_DRAW);
	BOptionControl(
		const char* name, const char* label, BMessage* message, uint32 flags = B_WILL_DRAW);
	virtual ~BOptionControl();

	void MessageReceived(BMessage* message) override;

	/// Adds an option behind the others.
	status_t AddOption(const char* name, int32 value);
	/// False without an option at \a index. The name is valid until the option goes; both pointers may be null.
	virtual bool GetOptionAt(int32 index, const char** _name, int32* _value) = 0;
	virtual void RemoveOptionAt(int32 index) = 0;
	virtual int32 CountOptions() const = 0;
	/// B_BAD_VALUE without a name or for an index below 0 or beyond the end.
	virtual status_t AddOptionAt(const char* name, int32 value, int32 index) = 0;
	/// The index of the chosen option, B_ERROR for none.
	virtual int32 SelectedOption(const char** name = NULL, int32* outValue = NULL) const = 0;

	/// Chooses the first option with that value or name, and sends nothing. B_ERROR without one.
	virtual status_t SelectOptionFor(int32 value);
	virtual status_t SelectOptionFor(const char* name);

protected:
	/// A message that chooses a value when this control gets it; the caller's.
	BMessage* MakeValueMessage(int32 value);
};

#endif // _OPTION_CONTROL_H
