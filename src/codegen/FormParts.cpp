// SPDX-License-Identifier: MIT
// What the emitters and the checks read of a design form, its components and the application.

#include "codegen/FormParts.h"

#include "app/WindowGuard.h"
#include "designer/DesignForm.h"
#include "designer/DesignFormView.h"
#include "model/AppComponent.h"
#include "model/Property.h"


TComponentOwner*
FormComponents(TDesignForm* form)
{
	return form->View();
}


bool
IsOwnedByForm(TDesignForm* form, const TComponent* component)
{
	return component->Owner() != nullptr && form->IsForm(component->Owner());
}


const char*
ParentExpression(TDesignForm* form, const TComponent* component)
{
	if (!IsOwnedByForm(form, component)) {
		const TComponent* owner = dynamic_cast<const TComponent*>(component->Owner());
		if (owner != nullptr)
			return owner->ComponentName();
	}
	return "FormView()";
}


const char*
PropertyText(const TComponent* component, const char* name)
{
	const TProperty* property = component->FindProperty(name);
	return property != nullptr ? property->Value() : "";
}


BString
FrameExpression(const TComponent* component)
{
	BString frame("BRect(");
	frame << PropertyText(component, "Left") << "," << PropertyText(component, "Top") << ","
		  << PropertyText(component, "Right") << "," << PropertyText(component, "Bottom") << ")";
	return frame;
}


TDesignForm*
FormAt(const TAppComponent* app, int32 index)
{
	return dynamic_cast<TDesignForm*>(app->ComponentAt(index));
}


TDesignForm*
FindMainForm(const TAppComponent* app)
{
	const int32 count = app->CountComponents();
	for (int32 i = 0; i < count; i++) {
		TDesignForm* form = FormAt(app, i);
		WindowGuard guard(form);
		if (guard.IsLocked() && form->IsMainForm())
			return form;
	}
	if (count == 0)
		return nullptr;

	TDesignForm* last = FormAt(app, count - 1);
	return last != nullptr ? last : FormAt(app, 0);
}
