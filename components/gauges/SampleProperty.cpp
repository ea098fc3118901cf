// SPDX-License-Identifier: MIT

#include "SampleProperty.h"

#include <cstdlib>

#include <Message.h>
#include <String.h>

TSampleProperty::TSampleProperty(TComponent* component, const char* name, const char* value)
	: TProperty(component, name, value, nullptr, true),
	  fSample(0),
	  fHasSample(false)
{
}


int32
TSampleProperty::Shown() const
{
	return fHasSample ? fSample : static_cast<int32>(strtol(Value(), nullptr, 10));
}


void
TSampleProperty::SetSample(int32 sample)
{
	fSample = sample;
	fHasSample = true;
}


void
TSampleProperty::RemoveSample()
{
	fHasSample = false;
}


void
TSampleProperty::WriteExtendedData(BMessage* message) const
{
	const BString field = FieldName();
	message->RemoveName(field.String());
	if (fHasSample)
		message->AddInt32(field.String(), fSample);
}


void
TSampleProperty::ReadExtendedData(const BMessage* message)
{
	int32 sample;
	if (message->FindInt32(FieldName().String(), &sample) == B_OK)
		SetSample(sample);
}


/// Of its own: the message has a field for each property, and may have those of other libraries.
BString
TSampleProperty::FieldName() const
{
	BString field("gauges:sample:");
	return field << Name();
}
