// SPDX-License-Identifier: MIT
// The editors of components that the user deletes.

#pragma once

#include <vector>

class TComponent;
class TPropertyEditor;

/// Notes the editors of components that are about to be destroyed, and deletes them at its end.
///
/// A component leaves its editors alone, and the property window may still be about to use one: this is to be
/// destroyed in that window's thread, when the component is gone and no longer shown. An editor that has gone by then,
/// because its component was so kind, is forgotten, and one that was not made with new is left alone. Any thread may
/// fill it, one at a time.
class TForgottenEditors {
public:
	TForgottenEditors();
	/// Deletes them.
	~TForgottenEditors();

	TForgottenEditors(const TForgottenEditors&) = delete;
	TForgottenEditors& operator=(const TForgottenEditors&) = delete;

	/// Notes the editors that \a component has now.
	void Add(const TComponent* component);

	/// Forgets them: they are not deleted.
	void Spare();

	/// \a editor is being destroyed.
	static void EditorGone(const TPropertyEditor* editor);

private:
	std::vector<TPropertyEditor*> fEditors;
};
