// SPDX-License-Identifier: MIT
// The kinds of value that a scripting property has.

#ifndef _PROPERTY_INFO_H
#define _PROPERTY_INFO_H

enum value_kind { B_COMMAND_KIND = 0, B_TYPE_CODE_KIND = 1 };

#endif // _PROPERTY_INFO_H
