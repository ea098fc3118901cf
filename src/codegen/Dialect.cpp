// SPDX-License-Identifier: MIT
// The dialects of C++ that sources can be generated in.

#include "codegen/Dialect.h"

#include <string.h>

#include "app/Preferences.h"

namespace {

constexpr const char* kSetting = "Dialect";
constexpr source_dialect kDialects[] = {DIALECT_CLASSIC, DIALECT_STANDARD};

} // namespace


const char*
DialectName(source_dialect dialect)
{
	return dialect == DIALECT_STANDARD ? "standard" : "classic";
}


bool
FindDialect(const char* name, source_dialect* dialect)
{
	for (const source_dialect each : kDialects) {
		if (strcmp(name, DialectName(each)) == 0) {
			*dialect = each;
			return true;
		}
	}
	return false;
}


source_dialect
PreferredDialect()
{
	source_dialect dialect = DIALECT_CLASSIC;
	const std::lock_guard<std::mutex> lock(AppSettingsLock);
	const char* name;
	if (AppSettings.FindString(kSetting, &name) == B_OK)
		FindDialect(name, &dialect);
	return dialect;
}


void
SetPreferredDialect(source_dialect dialect)
{
	const std::lock_guard<std::mutex> lock(AppSettingsLock);
	AppSettings.SetString(kSetting, DialectName(dialect));
}
