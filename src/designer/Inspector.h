// SPDX-License-Identifier: MIT
// The property window as design forms and the project use it.

#pragma once

#include <memory>
#include <vector>

class BView;
class TComponent;
class TForgottenEditors;

/// What is shown in the property window. In programs without one the operations do nothing.
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

/// The same, but a window that is hidden stays hidden.
void Load(TComponent* component, BView* designView);

/// Shows nothing if \a component, which may be gone, is shown.
void Leave(const TComponent* component);

/// Shows nothing if \a form or one of its \a components is shown; in the first case forgets the design view, too.
void LeaveForm(const TComponent* form, const std::vector<const TComponent*>& components);

/// Lets go of a form that is about to be destroyed, or has been: shows nothing if one of \a components is shown, and
/// forgets \a designView if that is the design view. Either may be gone: addresses are only compared.
void Forget(const std::vector<const TComponent*>& components, const BView* designView);

/// Has \a editors destroyed when the window has done what it is about to do with any of them. Takes no lock. Without
/// a window they are left alone.
void Bury(std::unique_ptr<TForgottenEditors> editors);

/// Brings the shown values up to date, soon. Takes no lock.
void Refresh();

/// Brings the window to the front.
void Activate();

} // namespace Inspector
