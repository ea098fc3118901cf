// SPDX-License-Identifier: MIT
// Reading a form's document.

#pragma once

#include <string>
#include <unordered_map>

#include <Rect.h>
#include <String.h>

#include "designer/FileStamp.h"

class BMessage;
class TComponent;
class TDesignFormView;
class TLoadReport;

/// Reads one form from its document; used once.
///
/// Whatever cannot be used is left out, told on standard output and added to the report. Locks the
/// form's window step by step.
class TFormReader {
public:
	/// \a report: may be none.
	TFormReader(TDesignFormView* form, TLoadReport* report);

	/// Reads the document at \a path into the form; false, with nothing changed, when that fails.
	bool Read(const char* path);

	/// Reads \a document, which is not in a file of its own, into the form. \a path: the form's file, for reports.
	bool ReadDocument(const BMessage& document, const char* path);

	/// What the document's file held.
	const TFileStamp& Stamp() const { return fStamp; }
	/// Whether a component of the document was left out.
	bool IsIncomplete() const { return fIsIncomplete; }

private:
	struct placement {
		std::string owner;
		BRect frame;
	};

	void ReadFormProperties(const BMessage& properties);
	void ReadFormEvents(const BMessage& events);
	void CreateComponents(const BMessage& collection);
	void CreateComponent(const char* savedName, const BMessage& record);
	void ReadProperties(TComponent* component, const BMessage& properties);
	void ReadEvents(TComponent* component, const BMessage& events);
	void NestComponents();
	void Nest(TComponent* child, TComponent* owner, const placement& place);
	void DropComponent(const char* savedName, const char* reason);

	TDesignFormView* fForm;
	TLoadReport* fReport;
	BString fPath;
	TFileStamp fStamp;
	bool fIsIncomplete;
	// By the components' saved names: who is inside another component, and where.
	std::unordered_map<std::string, placement> fPlacements;
};
