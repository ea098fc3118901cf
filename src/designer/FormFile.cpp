// SPDX-License-Identifier: MIT

#include "designer/FormFile.h"

const char* const kFormFileType = "application/x-plim-form";
const char* const kProjectFileType = "application/x-plim-project";

TPLIMFormFile::TPLIMFormFile(const char* fileName)
	: TPLIMFile(kFormFileType, fileName)
{
	what = 'PFrm';
}


TPLIMFormFile::~TPLIMFormFile() {}
