// SPDX-License-Identifier: MIT
// A component that keeps data of its own in documents and tells which hooks were called.

#pragma once

#include <string>
#include <vector>

#include <Message.h>
#include <View.h>

#include "model/Property.h"
#include "model/ViewComponent.h"

/// A property that writes its name into the message and notes what it is asked to do.
class TracerProperty : public TProperty {
public:
	TracerProperty(TComponent* component, const char* name)
		: TProperty(component, name, "", nullptr, false)
	{
	}

	void WriteExtendedData(BMessage* message) const override
	{
		message->AddInt32(fField.c_str(), ++fWritten);
	}

	void ReadExtendedData(const BMessage*) override { fRead++; }

	int32 CountRead() const { return fRead; }

private:
	const std::string fField = std::string("extended") + Name();
	mutable int32 fWritten = 0;
	int32 fRead = 0;
};

/// A component with the properties "Name", "A" and "B" alone, and data of its own in its record.
class TracerComponent : public TComponent {
public:
	TracerComponent(TFormDesigner* designer, BRect frame)
		: TComponent(nullptr, designer, CT_VISUAL)
	{
		SetComponentName("Tracer");
		SetClassName("TTracer");
		InitPropertyList();
		fA = new TracerProperty(this, "A");
		fB = new TracerProperty(this, "B");
		AddProperty(fA);
		AddProperty(fB);
		SetDTView(new BView(frame, "tracer", B_FOLLOW_NONE, 0));
	}

	void SetPropertyValue(const char* name, const char* value) override
	{
		fNamesSet.push_back(name);
		TComponent::SetPropertyValue(name, value);
	}

	void WriteExtendedComponentDataTo(BMessage* message) override
	{
		message->AddString("tracer", "own data");
	}

	void ReadExtendedComponentDataFrom(const BMessage* message) override
	{
		fOwnData = message->FindString("tracer");
	}

	const std::vector<std::string>& NamesSet() const { return fNamesSet; }
	const std::string& OwnData() const { return fOwnData; }
	TracerProperty* A() const { return fA; }
	TracerProperty* B() const { return fB; }

private:
	std::vector<std::string> fNamesSet;
	std::string fOwnData;
	TracerProperty* fA;
	TracerProperty* fB;
};
