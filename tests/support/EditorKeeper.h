// SPDX-License-Identifier: MIT
// Keeps account of the property editors, for programs whose leaks are checked.
#ifndef TESTS_SUPPORT_EDITOR_KEEPER_H
#define TESTS_SUPPORT_EDITOR_KEEPER_H

/// Deletes every editor on the heap that a component was given so far and that nobody has deleted.
///
/// Nobody owns editors, and they know their components: were editors suppressed as leaks, all that
/// they lead to would count as kept, and a forgotten component or form would go unseen. Call it when no
/// component is used any more. Needs the address sanitizer.
void DeleteForgottenEditors();

#endif // TESTS_SUPPORT_EDITOR_KEEPER_H
