// SPDX-License-Identifier: MIT
// BAppFileInfo: what an application's file tells about the application.

#ifndef _APP_FILE_INFO_H
#define _APP_FILE_INFO_H

#include <NodeInfo.h>

class BFile;
class BMessage;

enum info_variety {
	B_DEVELOPMENT_VERSION,
	B_ALPHA_VERSION,
	B_BETA_VERSION,
	B_GAMMA_VERSION,
	B_GOLDEN_MASTER_VERSION,
	B_FINAL_VERSION
};
enum info_location { B_USE_ATTRIBUTES = 0x1, B_USE_RESOURCES = 0x2, B_USE_BOTH_LOCATIONS = 0x3 };
enum version_kind { B_APP_VERSION_KIND, B_SYSTEM_VERSION_KIND };

/// Signature, launch flags and supported types of an application's file, kept in its attributes.
/// The file must stay alive. Getters give B_ENTRY_NOT_FOUND where nothing was set.
class BAppFileInfo : public BNodeInfo {
public:
	BAppFileInfo();
	BAppFileInfo(BFile* file);
	~BAppFileInfo() override;

	status_t SetTo(BFile* file);

	status_t GetType(char* type) const override;
	status_t SetType(const char* type) override;

	/// \a signature: B_MIME_TYPE_LENGTH bytes. Null removes it.
	status_t GetSignature(char* signature) const;
	status_t SetSignature(const char* signature);

	/// Launch flags, B_SINGLE_LAUNCH and so on.
	status_t GetAppFlags(uint32* flags) const;
	status_t SetAppFlags(uint32 flags);
	status_t RemoveAppFlags();

	/// Strings "types".
	status_t GetSupportedTypes(BMessage* types) const;
	/// With \a updateMimeDB each supported type that is missing in the database is installed.
	/// \a syncAll has no effect: the database keeps no list of applications.
	status_t SetSupportedTypes(const BMessage* types, bool updateMimeDB, bool syncAll);
	status_t SetSupportedTypes(const BMessage* types, bool syncAll);
	status_t SetSupportedTypes(const BMessage* types);
	/// Whether the type, or its supertype, is among the supported ones.
	bool IsSupportedType(const char* type) const;

	status_t GetIcon(BBitmap* icon, icon_size which = B_LARGE_ICON) const override;
	status_t GetIcon(uint8** data, size_t* size) const;
};

#endif
