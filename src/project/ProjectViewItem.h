// SPDX-License-Identifier: MIT
// One row of the project window's list.

#pragma once

#include <StringItem.h>

class TComponent;
class TDesignForm;

/// The row of the application or of a form. Neither is owned; lock the window that the list is in.
class TProjectViewItem : public BStringItem {
public:
	/// \a name: the component's name. \a form: none for the application.
	TProjectViewItem(TComponent* component, TDesignForm* form, const char* name);
	virtual ~TProjectViewItem();

	TComponent* Component() const { return fComponent; }
	TDesignForm* Form() const { return fForm; }

	/// The text of the row, at most 255 bytes of \a name. The list must be told to draw it.
	void SetName(const char* name);

private:
	TComponent* fComponent;
	TDesignForm* fForm;
	char fText[256];
};
