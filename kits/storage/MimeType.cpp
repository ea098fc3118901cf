// SPDX-License-Identifier: MIT
// BMimeType: a MIME type and what the user's database knows about it.

#include <MimeType.h>

#include <set>

#include <string.h>

#include <Entry.h>
#include <Errors.h>
#include <Message.h>
#include <Node.h>

#include "storage/MimeDatabase.h"
#include "storage/MimeGuess.h"
#include "storage/XmlReader.h"

using BPrivate::mime_description;
using BPrivate::mime_key;
using BPrivate::MimeDatabase;

namespace {

const size_t kMaxDescription = 255;


/// Writes a text that a package tells, or says that there is none.
status_t
CopyText(const std::string& text, size_t bufferSize, char* buffer)
{
	if (text.empty())
		return B_ENTRY_NOT_FOUND;
	const size_t length = min_c(text.size(), bufferSize - 1);
	memcpy(buffer, text.data(), length);
	buffer[length] = '\0';
	return B_OK;
}


bool
IsDescription(const char* text)
{
	return text == nullptr || (strlen(text) <= kMaxDescription && BPrivate::is_xml_text(text));
}


/// An extension as the name pattern of a package; empty when it can be none.
std::string
PatternFor(std::string extension)
{
	if (!extension.empty() && extension[0] == '.')
		extension.erase(0, 1);
	if (extension.empty() || extension.find_first_of("/*?[]") != std::string::npos
		|| !BPrivate::is_xml_text(extension.c_str()))
		return "";
	return "*." + extension;
}

} // namespace


BMimeType::BMimeType()
	: fStatus(B_NO_INIT)
{
}


BMimeType::BMimeType(const char* mimeType)
	: fStatus(B_NO_INIT)
{
	SetTo(mimeType);
}


BMimeType::~BMimeType() {}


status_t
BMimeType::SetTo(const char* mimeType)
{
	if (!IsValid(mimeType)) {
		fType.clear();
		fStatus = B_BAD_VALUE;
		return fStatus;
	}
	fType = mimeType;
	fStatus = B_OK;
	return B_OK;
}


void
BMimeType::Unset()
{
	fType.clear();
	fStatus = B_NO_INIT;
}


status_t
BMimeType::InitCheck() const
{
	return fStatus;
}


const char*
BMimeType::Type() const
{
	return fStatus == B_OK ? fType.c_str() : nullptr;
}


bool
BMimeType::IsValid() const
{
	return fStatus == B_OK;
}


bool
BMimeType::IsValid(const char* mimeType)
{
	if (mimeType == nullptr)
		return false;
	const size_t length = strlen(mimeType);
	if (length == 0 || length >= B_MIME_TYPE_LENGTH)
		return false;

	size_t slashes = 0;
	for (size_t i = 0; i < length; i++) {
		const unsigned char c = mimeType[i];
		if (c == '/') {
			if (++slashes > 1 || i == 0 || i == length - 1)
				return false;
		} else if (c <= ' ' || c >= 0x7f || strchr("<>@,;:\"()[]?=\\", c) != nullptr) {
			return false;
		}
	}
	return true;
}


bool
BMimeType::IsSupertypeOnly() const
{
	return fStatus == B_OK && fType.find('/') == std::string::npos;
}


status_t
BMimeType::GetSupertype(BMimeType* supertype) const
{
	if (supertype == nullptr)
		return B_BAD_VALUE;
	supertype->Unset();
	if (fStatus != B_OK)
		return fStatus;
	const size_t slash = fType.find('/');
	return slash == std::string::npos ? B_BAD_VALUE
									  : supertype->SetTo(fType.substr(0, slash).c_str());
}


bool
BMimeType::operator==(const BMimeType& type) const
{
	if (fStatus != B_OK || type.fStatus != B_OK)
		return fStatus != B_OK && type.fStatus != B_OK;
	return mime_key(fType) == mime_key(type.fType);
}


bool
BMimeType::operator==(const char* type) const
{
	return fStatus == B_OK && type != nullptr && mime_key(fType) == mime_key(type);
}


bool
BMimeType::Contains(const BMimeType* type) const
{
	if (type == nullptr || fStatus != B_OK || type->fStatus != B_OK)
		return false;
	if (*this == *type)
		return true;
	BMimeType supertype;
	return type->GetSupertype(&supertype) == B_OK && *this == supertype;
}


status_t
BMimeType::Install()
{
	if (fStatus != B_OK)
		return fStatus;
	if (IsInstalled())
		return B_FILE_EXISTS;
	return MimeDatabase::Default().Change(fType, [](mime_description*) {});
}


status_t
BMimeType::Delete()
{
	return fStatus == B_OK ? MimeDatabase::Default().Remove(fType) : fStatus;
}


bool
BMimeType::IsInstalled() const
{
	return fStatus == B_OK && MimeDatabase::Default().Has(fType);
}


status_t
BMimeType::GetPreferredApp(char* signature, app_verb) const
{
	if (signature == nullptr)
		return B_BAD_VALUE;
	mime_description description;
	if (fStatus != B_OK)
		return fStatus;
	MimeDatabase::Default().Find(fType, &description);
	return CopyText(description.preferredApp, B_MIME_TYPE_LENGTH, signature);
}


status_t
BMimeType::SetPreferredApp(const char* signature, app_verb)
{
	if (fStatus != B_OK)
		return fStatus;
	if (signature != nullptr && !IsValid(signature))
		return B_BAD_VALUE;
	const std::string text = signature == nullptr ? "" : signature;
	return MimeDatabase::Default().Change(
		fType, [&text](mime_description* description) { description->preferredApp = text; });
}


status_t
BMimeType::GetShortDescription(char* description) const
{
	if (description == nullptr)
		return B_BAD_VALUE;
	mime_description known;
	if (fStatus != B_OK)
		return fStatus;
	MimeDatabase::Default().Find(fType, &known);
	return CopyText(known.comment, kMaxDescription + 1, description);
}


status_t
BMimeType::SetShortDescription(const char* description)
{
	if (fStatus != B_OK)
		return fStatus;
	if (!IsDescription(description))
		return B_BAD_VALUE;
	const std::string text = description == nullptr ? "" : description;
	return MimeDatabase::Default().Change(
		fType, [&text](mime_description* changed) { changed->comment = text; });
}


status_t
BMimeType::GetLongDescription(char* description) const
{
	if (description == nullptr)
		return B_BAD_VALUE;
	mime_description known;
	if (fStatus != B_OK)
		return fStatus;
	MimeDatabase::Default().Find(fType, &known);
	return CopyText(known.longDescription, kMaxDescription + 1, description);
}


status_t
BMimeType::SetLongDescription(const char* description)
{
	if (fStatus != B_OK)
		return fStatus;
	if (!IsDescription(description))
		return B_BAD_VALUE;
	const std::string text = description == nullptr ? "" : description;
	return MimeDatabase::Default().Change(
		fType, [&text](mime_description* changed) { changed->longDescription = text; });
}


status_t
BMimeType::GetFileExtensions(BMessage* extensions) const
{
	if (extensions == nullptr)
		return B_BAD_VALUE;
	if (fStatus != B_OK)
		return fStatus;
	mime_description description;
	MimeDatabase::Default().Find(fType, &description);

	extensions->MakeEmpty();
	std::set<std::string> seen;
	for (const BPrivate::mime_glob& glob : description.globs) {
		if (!glob.pattern.starts_with("*.")
			|| glob.pattern.find_first_of("*?[", 1) != std::string::npos)
			continue;
		const std::string extension = glob.pattern.substr(2);
		if (seen.insert(extension).second)
			extensions->AddString("extensions", extension.c_str());
	}
	return seen.empty() ? B_ENTRY_NOT_FOUND : B_OK;
}


status_t
BMimeType::SetFileExtensions(const BMessage* extensions)
{
	if (fStatus != B_OK)
		return fStatus;

	std::vector<BPrivate::mime_glob> globs;
	const char* extension;
	for (int32 i = 0;
		 extensions != nullptr && extensions->FindString("extensions", i, &extension) == B_OK;
		 i++) {
		BPrivate::mime_glob glob;
		glob.pattern = PatternFor(extension);
		if (glob.pattern.empty())
			return B_BAD_VALUE;
		globs.push_back(glob);
	}
	return MimeDatabase::Default().Change(fType, [&globs](mime_description* description) {
		description->globs = globs;
		description->replacesGlobs = true;
	});
}


status_t
BMimeType::GetIcon(BBitmap* icon, icon_size) const
{
	if (icon == nullptr)
		return B_BAD_VALUE;
	return fStatus == B_OK ? B_ENTRY_NOT_FOUND : fStatus;
}


status_t
BMimeType::GetIcon(uint8** _data, size_t* _size) const
{
	if (_data == nullptr || _size == nullptr)
		return B_BAD_VALUE;
	return fStatus == B_OK ? B_ENTRY_NOT_FOUND : fStatus;
}


status_t
BMimeType::GetInstalledSupertypes(BMessage* supertypes)
{
	if (supertypes == nullptr)
		return B_BAD_VALUE;
	supertypes->MakeEmpty();
	std::set<std::string> seen;
	for (const std::string& type : MimeDatabase::Default().Types()) {
		const std::string supertype = mime_key(type.substr(0, type.find('/')));
		if (seen.insert(supertype).second)
			supertypes->AddString("super_types", supertype.c_str());
	}
	return B_OK;
}


status_t
BMimeType::GetInstalledTypes(BMessage* types)
{
	return GetInstalledTypes(nullptr, types);
}


status_t
BMimeType::GetInstalledTypes(const char* supertype, BMessage* subtypes)
{
	if (subtypes == nullptr)
		return B_BAD_VALUE;
	if (supertype != nullptr && !BMimeType(supertype).IsSupertypeOnly())
		return B_BAD_VALUE;

	subtypes->MakeEmpty();
	const std::string start = supertype == nullptr ? "" : mime_key(supertype) + "/";
	for (const std::string& type : MimeDatabase::Default().Types()) {
		if (mime_key(type).starts_with(start))
			subtypes->AddString("types", type.c_str());
	}
	return B_OK;
}


status_t
BMimeType::GuessMimeType(const entry_ref* file, BMimeType* type)
{
	if (file == nullptr || type == nullptr)
		return B_BAD_VALUE;
	type->Unset();
	const BNode node(file);
	const int fd = node.Dup();
	if (fd < 0)
		return fd;
	std::string guess;
	const status_t status = BPrivate::guess_descriptor_type(fd, file->name, &guess);
	close(fd);
	return status == B_OK ? type->SetTo(guess.c_str()) : status;
}


status_t
BMimeType::GuessMimeType(const void* buffer, int32 length, BMimeType* type)
{
	if (buffer == nullptr || length < 0 || type == nullptr)
		return B_BAD_VALUE;
	const std::string_view content(
		(const char*)buffer, min_c((size_t)length, BPrivate::kMimeContentSize));
	return type->SetTo(BPrivate::guess_mime_type(content, "").c_str());
}


status_t
BMimeType::GuessMimeType(const char* filename, BMimeType* type)
{
	if (filename == nullptr || type == nullptr)
		return B_BAD_VALUE;
	const char* slash = strrchr(filename, '/');
	const char* leaf = slash == nullptr ? filename : slash + 1;
	return type->SetTo(BPrivate::guess_mime_type("", leaf).c_str());
}
