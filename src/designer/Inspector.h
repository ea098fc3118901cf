// SPDX-License-Identifier: MIT
// The property window as design forms use it.

#pragma once

#include <vector>

class BView;
class TComponent;

/// What a design form shows in the property window. In programs without one the operations do nothing.
///
/// Each gives up the lock that the thread holds while it locks the property window: look up again what
/// that lock protects. A component that is destroyed, or goes to another form, must not be shown any longer.
namespace Inspector {

/// The component that is shown, or null.
TComponent* Component();

/// Shows \a component, edited with the window of \a designView locked, and the window itself when it is hidden.
void Show(TComponent* component, BView* designView);

/// The same, but nothing happens when \a component is shown already.
void ShowUnlessShown(TComponent* component, BView* designView);

/// Shows nothing if \a component, which may be gone, is shown.
void Leave(const TComponent* component);

/// Shows nothing if \a form or one of its \a components is shown; in the first case forgets the design view, too.
void LeaveForm(const TComponent* form, const std::vector<const TComponent*>& components);

/// Brings the shown values up to date, soon. Takes no lock.
void Refresh();

/// Brings the window to the front.
void Activate();

} // namespace Inspector
