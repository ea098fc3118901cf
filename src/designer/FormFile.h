// SPDX-License-Identifier: MIT
// The document of one form, and what the open panels show.

#pragma once

#include "designer/DocumentFile.h"

/// The MIME types of the two kinds of document.
extern const char* const kFormFileType;
extern const char* const kProjectFileType;

/// A document of type "application/x-plim-form" with the code 'PFrm'.
///
/// Fields, in this order: "_FormProperties" (message 'cprp': a string for each property of the form),
/// "_FormEvents" (message 'evts': a bool for each event), "Components" (message 'PCmp': under each
/// component's name a message 'info' that FormRecords.h describes).
class TPLIMFormFile : public TPLIMFile {
public:
	explicit TPLIMFormFile(const char* fileName = nullptr);
	virtual ~TPLIMFormFile();
};
