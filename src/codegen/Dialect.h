// SPDX-License-Identifier: MIT
// The dialects of C++ that sources can be generated in.

#pragma once

enum source_dialect {
	DIALECT_CLASSIC, // unqualified members as handlers, texts as they stand: for GCC with -fpermissive
	DIALECT_STANDARD // standard C++, without warnings
};

/// "classic" or "standard".
const char* DialectName(source_dialect dialect);

/// The dialect of that name; false, with \a dialect as it was, when there is none.
bool FindDialect(const char* name, source_dialect* dialect);

/// The dialect that the designer generates in: the setting "Dialect", classic when there is none. Any thread.
source_dialect PreferredDialect();
void SetPreferredDialect(source_dialect dialect);
