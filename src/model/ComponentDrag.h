// SPDX-License-Identifier: MIT
// The component that the mouse drags.

#pragma once

class BLooper;
class BMessage;
class TComponent;

/// Which component of this program is being dragged, so that a drop can trust its pointer: a message may come from
/// another running designer, or late, when the component is gone. One drag at a time: the newest counts. Any thread.
namespace ComponentDrag {

/// A drag of \a component, whose view's window is locked, begins: writes the fields of its message.
///
/// "component" (pointer), and "drag" (int64), a number that no other drag has, in whatever program.
void Begin(TComponent* component, BMessage* message);

/// Called when \a component is destroyed.
void Forget(const TComponent* component);

/// The dragged component if \a message brings it, null otherwise.
///
/// It may be destroyed as soon as this returns, unless the window of its view is locked.
TComponent* Find(const BMessage* message);

/// The window that \a component was dragged from; null when it is not the dragged one. It may be gone.
BLooper* WindowOf(const TComponent* component);

} // namespace ComponentDrag
