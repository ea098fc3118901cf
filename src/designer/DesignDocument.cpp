// SPDX-License-Identifier: MIT
// The design surface as a document: its file, and the copies of what is not saved yet.

#include <cstring>

#include <Message.h>
#include <String.h>
#include <Window.h>

#include "app/Dialogs.h"
#include "app/TypedMessage.h"
#include "app/WindowGuard.h"
#include "designer/DesignForm.h"
#include "designer/DesignFormView.h"
#include "designer/FormFile.h"
#include "designer/FormHost.h"
#include "designer/FormReader.h"
#include "designer/FormWriter.h"
#include "designer/KeptOriginal.h"
#include "designer/Recovery.h"
#include "model/Diagnostics.h"
#include "model/FixedText.h"

bool
TDesignFormView::SaveToFile(const char* path)
{
	// What could not be read is nowhere but in the file.
	if (fIsIncomplete && strcmp(path, fFilename) == 0 && KeepOriginal(path) != B_OK)
		return false;
	TFormWriter writer(this);
	if (!writer.Write(path))
		return false;
	SetFilename(path);
	fStamp = writer.Stamp();
	fIsIncomplete = false;
	SetModified(false);
	fForm->TFormComponent::SetModified(false);
	ForgetCopy();
	return true;
}


form_save_result
TDesignFormView::SaveAfterAsking(const char* path)
{
	const BString file(path);
	if (IsChangedOnDisk(path)) {
		BString text("Another program has changed the file '");
		text << file << "' since the form '" << fForm->ComponentName()
			 << "' was opened or saved here. Overwriting it loses those changes.";
		WindowRelease release;
		if (MsgBox("Warning", text.String(), "Cancel", "Overwrite", nullptr, B_WIDTH_AS_USUAL,
				B_WARNING_ALERT)
			!= 1)
			return FORM_SAVE_CANCELED;
	}
	return SaveToFile(file.String()) ? FORM_SAVED : FORM_NOT_SAVED;
}


bool
TDesignFormView::LoadFromFile(const char* path, TLoadReport* report)
{
	TFormReader reader(this, report);
	if (!reader.Read(path))
		return false;
	SetFilename(path);
	fStamp = reader.Stamp();
	fIsIncomplete = reader.IsIncomplete();
	SetModified(false);
	fForm->TFormComponent::SetModified(false);
	// Nobody asked whether what was there before is wanted: its copy stays, for the next start.
	fCopyId = 0;
	return true;
}


void
TDesignFormView::SetFilename(const char* name)
{
	if (name == nullptr)
		return;
	if (strcmp(name, fFilename) != 0) {
		fStamp = TFileStamp();
		fIsIncomplete = false;
	}
	SetFixedText(fFilename, name);
}


bool
TDesignFormView::IsChangedOnDisk(const char* path) const
{
	return strcmp(path, fFilename) == 0 && fStamp.Differs(path);
}


/// Has a recovery copy made when the present gesture is over.
void
TDesignFormView::WantCopy()
{
	// A form without a thread of its own is not used by a person.
	if (fCopyIsDue || TRecovery::Current() == nullptr || fForm->Thread() < 0)
		return;
	fCopyIsDue = fForm->PostMessage(DFM_KEEPCOPY) == B_OK;
}


void
TDesignFormView::KeepDueCopy()
{
	if (fCopyIsDue)
		KeepCopy();
}


void
TDesignFormView::KeepCopy()
{
	fCopyIsDue = false;
	TRecovery* recovery = TRecovery::Current();
	if (recovery == nullptr || !(Modified() || fForm->TFormComponent::Modified()))
		return;

	TDiagnosticSilence silence;
	std::unique_ptr<BMessage> copy = std::make_unique<BMessage>(RECOVERY_COPY);
	TTypedMessage document('PFrm');
	TFormWriter(this).WriteInto(&document);
	const TFormHost* host = fForm->Host();
	copy->AddString("project", host != nullptr ? host->ProjectFile() : "");
	copy->AddString("path", fFilename);
	copy->AddString("name", fForm->ComponentName());
	copy->AddBool("main", fIsMainForm);
	int32 index = 0;
	if (host != nullptr) {
		for (const TDesignForm* form : host->Forms()) {
			if (form == fForm)
				break;
			index++;
		}
	}
	copy->AddInt32("index", index);
	if (fStamp.IsTaken()) {
		copy->AddInt64("size", fStamp.Size());
		copy->AddInt64("fingerprint", static_cast<int64>(fStamp.Fingerprint()));
	}
	copy->AddBool("incomplete", fIsIncomplete);
	if (copy->AddMessage("form", &document) != B_OK)
		return;
	if (fCopyId == 0)
		fCopyId = recovery->NewId();
	recovery->Keep(fCopyId, std::move(copy));
}


void
TDesignFormView::ForgetCopy()
{
	fCopyIsDue = false;
	TRecovery* recovery = TRecovery::Current();
	if (fCopyId != 0 && recovery != nullptr)
		recovery->Forget(fCopyId);
	fCopyId = 0;
}


bool
TDesignFormView::LoadCopy(const BMessage& copy, int32 id)
{
	BMessage document;
	const char* path = "";
	copy.FindString("path", &path);
	TFormReader reader(this, nullptr);
	if (copy.FindMessage("form", &document) != B_OK || !reader.ReadDocument(document, path))
		return false;

	SetFilename(path);
	int64 size;
	int64 fingerprint;
	if (copy.FindInt64("size", &size) == B_OK
		&& copy.FindInt64("fingerprint", &fingerprint) == B_OK)
		fStamp = TFileStamp(size, static_cast<uint64>(fingerprint));
	fIsIncomplete = reader.IsIncomplete() || copy.GetBool("incomplete", false);
	fCopyId = id;
	SetModified(true);
	return true;
}
