// SPDX-License-Identifier: MIT
// The constants that several components let the user choose from.

#pragma once

#include <InterfaceDefs.h>

#include "ChoiceProperty.h"

constexpr choice kAlignments[] = {{"B_ALIGN_LEFT", B_ALIGN_LEFT}, {"B_ALIGN_RIGHT", B_ALIGN_RIGHT},
	{"B_ALIGN_CENTER", B_ALIGN_CENTER}};

constexpr choice kBorders[] = {{"B_FANCY_BORDER", B_FANCY_BORDER},
	{"B_PLAIN_BORDER", B_PLAIN_BORDER}, {"B_NO_BORDER", B_NO_BORDER}};
