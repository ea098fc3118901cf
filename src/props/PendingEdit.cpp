// SPDX-License-Identifier: MIT
// An edit that is confirmed later.

#include "props/PendingEdit.h"

#include <View.h>

#include "app/MainWindow.h"
#include "app/WindowGuard.h"
#include "model/Component.h"
#include "model/Property.h"
#include "props/PropertyEditor.h"
#include "props/PropertyWin.h"


TPendingEdit::TPendingEdit(TPropertyEditor* editor)
	: fEditor(editor),
	  fProperty(editor != nullptr ? editor->Property() : nullptr),
	  fFormWindow(nullptr)
{
	const TComponent* component = editor != nullptr ? editor->Component() : nullptr;
	if (component != nullptr && component->DTView() != nullptr)
		fFormWindow = component->DTView()->Looper();
	if (PlimWin* mainWindow = MainWindow())
		fInspector = BMessenger(mainWindow->PropertyWindow());
}


TPendingEdit::TPendingEdit(const TPendingEdit& other)
	: fEditor(other.fEditor),
	  fFormWindow(other.fFormWindow),
	  fInspector(other.fInspector)
{
	fProperty.SetTo(other.fProperty);
}


bool
TPendingEdit::Read(BString* text) const
{
	// Without the property the form may be gone, too.
	if (fProperty.Property() == nullptr)
		return false;
	WindowGuard guard(fFormWindow);
	const TProperty* property = fProperty.Property();
	if (property == nullptr)
		return false;
	text->SetTo(property->Value(), TPropertyText::kSize);
	return true;
}


void
TPendingEdit::Confirm(const BString& text)
{
	if (fProperty.Property() == nullptr)
		return;
	{
		WindowGuard guard(fFormWindow);
		if (fProperty.Property() == nullptr)
			return;
		fEditor->ApplyValue(text.String());
	}
	fInspector.SendMessage(PWM_REFRESH);
}
