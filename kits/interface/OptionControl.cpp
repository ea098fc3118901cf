// SPDX-License-Identifier: MIT
#include <OptionControl.h>

#include <cstring>

#include <Message.h>

BOptionControl::BOptionControl(BRect frame, const char* name, const char* label, BMessage* message,
	uint32 resizeMask, uint32 flags)
	: BControl(frame, name, label, message, resizeMask, flags)
{
}


BOptionControl::BOptionControl(const char* name, const char* label, BMessage* message, uint32 flags)
	: BControl(name, label, message, flags)
{
}


BOptionControl::~BOptionControl() {}


void
BOptionControl::MessageReceived(BMessage* message)
{
	if (message->what != B_OPTION_CONTROL_VALUE) {
		BControl::MessageReceived(message);
		return;
	}
	int32 value;
	if (message->FindInt32("be:value", &value) != B_OK)
		return;
	SetValue(value);
	// What is sent may have the control deleted: nothing comes after it.
	Invoke();
}


status_t
BOptionControl::AddOption(const char* name, int32 value)
{
	return AddOptionAt(name, value, CountOptions());
}


status_t
BOptionControl::SelectOptionFor(int32 value)
{
	int32 candidate;
	for (int32 i = 0; GetOptionAt(i, NULL, &candidate); i++) {
		if (candidate == value) {
			SetValue(value);
			return B_OK;
		}
	}
	return B_ERROR;
}


status_t
BOptionControl::SelectOptionFor(const char* name)
{
	if (name == NULL)
		return B_ERROR;
	const char* candidate;
	int32 value;
	for (int32 i = 0; GetOptionAt(i, &candidate, &value); i++) {
		if (strcmp(candidate, name) == 0) {
			SetValue(value);
			return B_OK;
		}
	}
	return B_ERROR;
}


BMessage*
BOptionControl::MakeValueMessage(int32 value)
{
	BMessage* message = new BMessage(B_OPTION_CONTROL_VALUE);
	message->AddInt32("be:value", value);
	return message;
}
