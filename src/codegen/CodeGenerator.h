// SPDX-License-Identifier: MIT
// Writes the sources of a designed application.

#pragma once

#include <Messenger.h>

#include "codegen/SourceWriter.h"

class BStringList;
class TAppComponent;
class TAppEmitter;
class TAppHeaderEmitter;
class TAppSourceEmitter;
class TDesignForm;
class TFormEmitter;
class TFormHeaderEmitter;
class TFormSourceEmitter;
class TProjectEmitter;

/// The generator: it owns the folder that the files go to and drives an emitter for each of them.
///
/// Each file is read when it exists, edited by a new emitter, rid of its placeholders and written. A generator
/// for another dialect of the runtime library overrides the operations that make the emitters. Use it from one
/// thread at a time; it locks the forms one by one, so call it with no window locked but by a WindowGuard or from
/// a window's own hooks.
class TCodeGenerator {
public:
	TCodeGenerator();
	TCodeGenerator(const TCodeGenerator&) = delete;
	TCodeGenerator& operator=(const TCodeGenerator&) = delete;
	virtual ~TCodeGenerator();

	/// Make a new emitter, which is the caller's. For a null emitter no file is written, and generating it
	/// counts as done.
	virtual TFormHeaderEmitter* FormHeaderEmitter(TDesignForm* form);
	virtual TFormSourceEmitter* FormSourceEmitter(TDesignForm* form);
	virtual TAppHeaderEmitter* AppHeaderEmitter(TAppComponent* app);
	virtual TAppSourceEmitter* AppSourceEmitter(TAppComponent* app);
	virtual TProjectEmitter* ProjectEmitter(TAppComponent* app);

	/// Shows the dialog in which the user confirms the settings, and which then generates; true at once.
	virtual bool ConfirmSettings();

	/// Generates every form and the application, creating the folder when it is missing.
	///
	/// A folder that cannot be created is told in a box, and nothing is generated. The result is false in any
	/// case and tells nothing; Writer() knows what became of each file.
	virtual bool GenerateApp();
	virtual bool GenerateAppHeader();
	virtual bool GenerateAppSource();

	/// The header first; the sources only when it succeeded. True: a file that cannot be written is noted by
	/// Writer() and nowhere else.
	virtual bool GenerateForm(TDesignForm* form);
	virtual bool GenerateFormHeader(TDesignForm* form);
	virtual bool GenerateFormSource(TDesignForm* form);

	/// \a app: not owned, may be null. Its "GenerationPath" property becomes the generation path.
	void SetAppComponent(TAppComponent* app);
	TAppComponent* AppComponent() const { return fAppComponent; }

	/// The folder that the files are written to, empty at first. At most 255 bytes are kept.
	const char* GenerationPath() const { return fGenerationPath; }
	/// Null is ignored.
	void SetGenerationPath(const char* path);

	/// Whether the dialog is open. The application component must stay until it is closed.
	bool IsConfirming() const { return fDialog.IsValid(); }

	/// What writes the files, and knows what happened to them.
	TSourceWriter& Writer() { return fWriter; }

private:
	BString TargetPath(const char* baseName, const char* ending) const;
	template <typename Emitter, typename Subject>
	bool StartTarget(Emitter* emitter, Subject* subject, const BString& path, BString& text);
	bool ReadTarget(const char* path, bool* exists, BString& text);
	void WriteFormText(TDesignForm* form, const BString& path, BString& text);
	void WriteAppText(const BString& path, BString& text);
	void RemarkSkippedSections(const BString& path, const BStringList& sections);

	TAppComponent* fAppComponent;
	// For generators derived from this one; nothing here uses them.
	void* fReserved[5];
	char fGenerationPath[256];
	TSourceWriter fWriter;
	BMessenger fDialog;
};

/// The generator of this program; it generates in the dialect that the user prefers.
TCodeGenerator* Generator();
