// SPDX-License-Identifier: MIT
// The in-place editors of the property window.

#pragma once

#include <vector>

#include <Rect.h>
#include <String.h>

#include "props/PropertyEditor.h"

class BBox;
class BButton;
class BHandler;
class BMenuField;
class BPopUpMenu;
class BTextControl;
class BView;

/// What a pane shows of a property and its editor, read at one moment.
struct TEditorState {
	/// Reads \a property and \a editor (may be null). Needs the lock of the component's form.
	TEditorState(TProperty* property, TPropertyEditor* editor, TPropEditType type);

	TProperty* property; // for messages; may be gone by the time they arrive
	BString name;
	BString value;
	BString displayValue;
	int32 limit;
	bool hasEditor;
	std::vector<BString> choices;
};


/// A pane for each type of editor, of which one is shown. The controls send the PWM_ messages to their window.
/// Lock the window.
class TEditorPanes {
public:
	/// Adds the panes to \a page, on \a frame in its coordinates. They follow its width.
	TEditorPanes(BView* page, BRect frame);

	/// Makes the controls of that pane.
	void InitEditorFor(TPropEditType type);

	/// Shows the pane of \a type with \a state.
	///
	/// True when another pane was hidden that had the keyboard focus, which is nowhere now: give it to another view.
	bool Show(TPropEditType type, const TEditorState& state);

	/// Gives the keyboard focus to the shown pane's control, if it takes it.
	void Focus();

	/// Presses the shown pane's button, as the user does.
	void PressButton();

	/// Of a choice between two, takes the other one.
	void FlipPick();

	/// The field that is shown and has the keyboard focus; null when none has.
	BTextControl* FocusedField() const;

	/// What is typed in the pane for strings.
	const char* StringText() const;
	void SetModalText(const char* text);

private:
	static constexpr int32 kCount = PET_NONE + 1;

	bool ShowPane(TPropEditType type);
	bool TakeFocus(TPropEditType type);
	BTextControl* AddField(TPropEditType type, const char* name, float width, uint32 command);
	BButton* AddButton(TPropEditType type, const char* name, uint32 command);
	bool PickMenuOffers(const TEditorState& state) const;
	void FillPickMenu(const TEditorState& state);

	BBox* fPanes[kCount];
	TPropEditType fShown;
	BTextControl* fStringField;
	BTextControl* fModalField;
	BButton* fModalButton;
	BTextControl* fListField;
	BButton* fListButton;
	BMenuField* fPickField;
	BPopUpMenu* fPickMenu;
};
