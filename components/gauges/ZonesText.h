// SPDX-License-Identifier: MIT
// The zones of a dial as text.

#pragma once

#include <vector>

#include <gauges/DialView.h>

/// Reads "0..60 {60,160,60,255}|60..80 {230,170,40,255}": zones divided by \a divider. False, \a zones not written,
/// when one of them is anything else or ends before it begins. An empty text has no zones.
bool ReadZones(const char* text, char divider, std::vector<Gauges::zone>* zones);

/// The text of \a zones.
BString ZonesText(const std::vector<Gauges::zone>& zones, char divider);
