// SPDX-License-Identifier: MIT

#include "designer/FormWriter.h"

#include <View.h>

#include "designer/DesignForm.h"
#include "designer/DesignFormView.h"
#include "designer/FormFile.h"
#include "model/Diagnostics.h"
#include "model/Event.h"
#include "model/Property.h"
#include "model/ViewLock.h"

namespace {

const char*
BoolText(bool value)
{
	return value ? "true" : "false";
}

} // namespace

TFormWriter::TFormWriter(TDesignFormView* form)
	: fForm(form),
	  fRecord('info'),
	  fProperties('cprp'),
	  fEvents('evts')
{
}


bool
TFormWriter::Write(const char* path)
{
	TPLIMFormFile file;
	WriteInto(&file);
	file.SetFilename(path);
	if (!file.SaveFile())
		return false;
	fStamp = file.Stamp();
	return true;
}


void
TFormWriter::WriteInto(TTypedMessage* document)
{
	AddFormProperties(&fProperties);
	AddFormEvents(&fEvents);
	if (document->SetMessage("_FormProperties", &fProperties) != B_OK)
		PrintDiagnostic("Warning: Unable to save form properties\n");
	if (document->SetMessage("_FormEvents", &fEvents) != B_OK)
		PrintDiagnostic("Warning: Unable to save form events\n");

	BMessage collection('PCmp');
	AddComponents(&collection);
	document->AddMessage("Components", &collection);
}


void
TFormWriter::AddFormProperties(BMessage* properties)
{
	TFormComponent* form = fForm->DesignWindow();
	for (int32 i = 0; i < form->CountProperties(); i++) {
		TProperty* property = form->PropertyAt(i);
		PrintDiagnostic("Writing form property %s: %s\n", property->Name(), property->Value());
		properties->AddString(property->Name(), property->Value());
	}
}


void
TFormWriter::AddFormEvents(BMessage* events)
{
	TFormComponent* form = fForm->DesignWindow();
	for (int32 i = 0; i < form->CountEvents(); i++) {
		TEvent* event = form->EventAt(i);
		PrintDiagnostic("Writing form event %s: %s\n", event->name, BoolText(event->selected));
		events->AddBool(event->name, event->selected);
	}
}


void
TFormWriter::AddComponents(BMessage* collection)
{
	for (int32 i = 0; i < fForm->CountComponents(); i++)
		AddComponent(i, collection);
}


void
TFormWriter::AddComponent(int32 index, BMessage* collection)
{
	TComponent* component = fForm->ComponentAt(index);
	fRecord.MakeEmpty();
	fProperties.MakeEmpty();
	fEvents.MakeEmpty();
	PrintDiagnostic("*** %s info ***\n", component->ComponentName());

	AddPlace(component);
	AddProperties(component, index);
	AddEvents(component);
	component->WriteExtendedComponentDataTo(&fRecord);
	if (fRecord.AddMessage("Properties", &fProperties) != B_OK)
		PrintDiagnostic("Warning: Unable to add Prop Info to ComponentInfo\n");
	if (fRecord.AddMessage("Events", &fEvents) != B_OK)
		PrintDiagnostic("Warning: Unable to add Event Info to ComponentInfo\n");
	if (collection->AddMessage(component->ComponentName(), &fRecord) != B_OK)
		PrintDiagnostic("Warning: Unable to add the component to the collection\n");
}


void
TFormWriter::AddPlace(TComponent* component)
{
	if (fProperties.AddString("_ClassName", component->ClassName()) != B_OK)
		PrintDiagnostic("Warning: Unable to add class name\n");

	{
		TViewLock lock(fForm);
		const BView* view = component->DTView();
		if (lock.IsLocked()
			&& (view == nullptr || fProperties.AddRect("_Frame", view->Frame()) != B_OK))
			PrintDiagnostic("Warning: Unable to add frame\n");
	}

	if (component->Owner() == nullptr || fForm->IsForm(component->Owner()))
		return;
	TComponent* owner = dynamic_cast<TComponent*>(component->Owner());
	if (owner == nullptr)
		return;
	PrintDiagnostic(
		"  Writing Owner name for %s: %s\n", component->ComponentName(), owner->ComponentName());
	fProperties.AddString("_OwnerName", owner->ComponentName());
}


void
TFormWriter::AddProperties(TComponent* component, int32 index)
{
	// After each property its writer's hook is due, but of the property that stands where the component
	// stands in the form: files written so far hold what that one adds. Many components have no
	// property there.
	TProperty* extended = component->PropertyAt(index);

	PrintDiagnostic(">> %s Properties:\n", component->ComponentName());
	for (int32 i = 0; i < component->CountProperties(); i++) {
		TProperty* property = component->PropertyAt(i);
		PrintDiagnostic(
			"  %s.%s(%s)\n", component->ComponentName(), property->Name(), property->Value());
		fProperties.AddString(property->Name(), property->Value());
		if (extended != nullptr)
			extended->WriteExtendedData(&fProperties);
	}
}


void
TFormWriter::AddEvents(TComponent* component)
{
	PrintDiagnostic("\n>> %s Events:\n", component->ComponentName());
	for (int32 i = 0; i < component->CountEvents(); i++) {
		TEvent* event = component->EventAt(i);
		PrintDiagnostic("  Writing %s.%s(%s)\n", component->ComponentName(), event->name,
			BoolText(event->selected));
		fEvents.AddBool(event->name, event->selected);
	}
}
