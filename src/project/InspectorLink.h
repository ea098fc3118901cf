// SPDX-License-Identifier: MIT
// What the project asks of the property window. Nothing happens in programs without one.

#pragma once

class BView;
class TComponent;
class TDesignForm;

/// Shows \a component; its values are edited with the window of \a designView locked. Any thread, with no
/// window locked but by a WindowGuard.
void ShowInInspector(TComponent* component, BView* designView);

/// Makes the property window let go of \a form and its components, which are about to be destroyed. Any thread,
/// with no window locked but by a WindowGuard.
void ForgetInInspector(TDesignForm* form);

/// Shows the values as they are now. Any thread.
void RefreshInspector();
