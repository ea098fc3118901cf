// SPDX-License-Identifier: MIT

#include "SourceText.h"

#include <String.h>

void
AppendLiteral(BString& source, const char* text)
{
	BString escaped(text);
	escaped.ReplaceAll("\\", "\\\\");
	escaped.ReplaceAll("\"", "\\\"");
	escaped.ReplaceAll("\n", "\\n");
	source << "\"" << escaped << "\"";
}
