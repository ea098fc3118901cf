// SPDX-License-Identifier: MIT
// What the emitters and the checks read of a design form, its components and the application.

#pragma once

#include <String.h>

class TAppComponent;
class TComponent;
class TComponentOwner;
class TDesignForm;

/// The list of all components on \a form, those inside container components included.
TComponentOwner* FormComponents(TDesignForm* form);

/// Whether \a component stands on the form itself and not in a container component.
bool IsOwnedByForm(TDesignForm* form, const TComponent* component);

/// The expression for the view that receives \a component: "FormView()", or its container's name.
const char* ParentExpression(TDesignForm* form, const TComponent* component);

/// The value of the property \a name, at most 1024 bytes; empty when there is no such property. Valid until the
/// value changes.
const char* PropertyText(const TComponent* component, const char* name);

/// The frame of a form or component as source text.
BString FrameExpression(const TComponent* component);

/// The design form at \a index of the application's form list, or null when another thing stands there.
TDesignForm* FormAt(const TAppComponent* app, int32 index);

/// The form that the generated program opens: the first that is marked as main form; with none marked
/// the last item of the list, and when that is no form, the first. Null when there is none. Locks the forms one by one.
TDesignForm* FindMainForm(const TAppComponent* app);
