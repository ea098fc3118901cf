// SPDX-License-Identifier: MIT

#include "designer/DocumentFile.h"

#include <cstring>

#include <Entry.h>
#include <File.h>
#include <NodeInfo.h>
#include <TypeConstants.h>

#include "app/ReplacementFile.h"
#include "model/FixedText.h"

namespace {

constexpr uint32 kDocument = 'PlmF';
constexpr const char* kDesignerSignature = "application/x-qtx.Plim";

} // namespace

TPLIMFile::TPLIMFile(const char* mimeType, const char* fileName)
	: TTypedMessage(kDocument),
	  fFilename(),
	  fFilenameCut(false),
	  fFileType(),
	  fStatus(B_NO_INIT)
{
	SetFixedText(fFileType, mimeType);
	if (fileName != nullptr) {
		SetFilename(fileName);
		OpenFile();
	}
}


TPLIMFile::~TPLIMFile() {}


bool
TPLIMFile::SaveFile()
{
	fStatus = WriteDocument();
	return fStatus == B_OK;
}


bool
TPLIMFile::OpenFile()
{
	fStatus = ResolvePath();
	if (fStatus != B_OK)
		return false;

	// Opening a pipe would wait for somebody to write into it.
	BEntry entry(fPath.Path(), true);
	if (entry.Exists() && !entry.IsFile()) {
		fStatus = entry.IsDirectory() ? B_IS_A_DIRECTORY : B_NOT_ALLOWED;
		return false;
	}
	BFile file(fPath.Path(), B_READ_ONLY);
	fStatus = file.InitCheck();
	if (fStatus != B_OK)
		return false;

	fStatus = Unflatten(&file);
	if (fStatus != B_OK)
		return false;
	fStamp.Take(&file);
	return true;
}


void
TPLIMFile::SetFilename(const char* name)
{
	if (name == nullptr)
		return;
	SetFixedText(fFilename, name);
	fFilenameCut = strlen(name) >= sizeof(fFilename);
}


void
TPLIMFile::SetAttribute(const char* name, const char* value)
{
	fAttributes.push_back({name, value});
}


status_t
TPLIMFile::ResolvePath()
{
	return fFilenameCut ? B_NAME_TOO_LONG : fPath.SetTo(fFilename);
}


status_t
TPLIMFile::WriteDocument()
{
	status_t status = ResolvePath();
	if (status != B_OK)
		return status;

	TReplacementFile file(fPath.Path());
	status = file.InitCheck();
	if (status == B_OK)
		status = Flatten(file.Stream());
	if (status == B_OK)
		status = file.KeepTail();
	if (status != B_OK)
		return status;

	// A file system without attributes keeps documents all the same: the type is then found from
	// the content and the name.
	BNodeInfo info(file.Stream());
	info.SetType(fFileType);
	info.SetPreferredApp(kDesignerSignature, B_OPEN);
	WriteAttributes(file.Stream());

	TFileStamp stamp;
	stamp.Take(file.Stream());
	status = file.Replace();
	if (status == B_OK)
		fStamp = stamp;
	return status;
}


void
TPLIMFile::WriteAttributes(BNode* node) const
{
	for (const text_attribute& attribute : fAttributes)
		node->WriteAttr(attribute.name.String(), B_STRING_TYPE, 0, attribute.value.String(),
			attribute.value.Length() + 1);
}
