// SPDX-License-Identifier: MIT
// What the project asks of the property window. Nothing happens in programs without one.

#pragma once

#include <vector>

class BView;
class TComponent;
class TDesignForm;

/// What the property window may show of a form. The form may be gone: the addresses are only compared.
struct inspected_form {
	BView* view = nullptr;
	std::vector<TComponent*> components;
};

/// Shows \a component; its values are edited with the window of \a designView locked. Any thread, with no
/// window locked but by a WindowGuard.
void ShowInInspector(TComponent* component, BView* designView);

/// Any thread, with no window locked but by a WindowGuard.
inspected_form WhatIsInspected(TDesignForm* form);

/// Makes the property window let go of a form that is about to be destroyed, or has been. Any thread, with no
/// window locked but by a WindowGuard.
void ForgetInInspector(const inspected_form& form);

/// Shows the values as they are now. Any thread.
void RefreshInspector();
