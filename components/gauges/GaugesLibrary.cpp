// SPDX-License-Identifier: MIT
// The library of gauges: its entries, and the functions that the designer looks up.

#include <ComponentKit.h>
#include <image.h>

#include "ClockComponent.h"
#include "GaugeComponent.h"

namespace {

template <class Class>
class TGaugesEntry : public TClassEntry<Class> {
public:
	using TClassEntry<Class>::TClassEntry;

	const char* Copyright() const override { return "Gauges for Plimworks"; }
};

TGaugesEntry<TGaugeComponent> sGauge(0, "Gauge", "TGauge");
TGaugesEntry<TClockComponent> sClock(1, "Clock", "TClock");

TPaletteEntry* const kEntries[] = {&sGauge, &sClock};
constexpr uint32 kEntryCount = sizeof(kEntries) / sizeof(kEntries[0]);

} // namespace

extern "C" bool
InitComponentLib(image_id)
{
	return true;
}


extern "C" void
UnInitComponentLib()
{
}


extern "C" uint32
CountComponents()
{
	return kEntryCount;
}


extern "C" TPaletteEntry*
EntryAt(uint32 index)
{
	return index < kEntryCount ? kEntries[index] : nullptr;
}
