// SPDX-License-Identifier: MIT
// Writing a form's document.

#pragma once

#include <Message.h>

#include "designer/FileStamp.h"

class TComponent;
class TDesignFormView;
class TTypedMessage;

/// Writes one form into its document; used once.
///
/// What is written is told line by line on standard output, and so is what could not be added; the
/// writing then goes on. Locks the form's window for each component's frame.
class TFormWriter {
public:
	explicit TFormWriter(TDesignFormView* form);

	/// Writes the document to \a path; false, with the file as it was, when that fails.
	bool Write(const char* path);

	/// Fills \a document with the fields of a form's document.
	void WriteInto(TTypedMessage* document);

	/// What the document's file holds.
	const TFileStamp& Stamp() const { return fStamp; }

private:
	void AddFormProperties(BMessage* properties);
	void AddFormEvents(BMessage* events);
	void AddComponents(BMessage* collection);
	void AddComponent(int32 index, BMessage* collection);
	void AddPlace(TComponent* component);
	void AddProperties(TComponent* component, int32 index);
	void AddEvents(TComponent* component);

	TDesignFormView* fForm;
	// Scratch messages, emptied for each component.
	BMessage fRecord;
	BMessage fProperties;
	BMessage fEvents;
	TFileStamp fStamp;
};
