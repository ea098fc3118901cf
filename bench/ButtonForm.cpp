// SPDX-License-Identifier: MIT

#include "ButtonForm.h"

#include <cstdio>

#include <Path.h>
#include <Rect.h>
#include <String.h>

#include "designer/DesignForm.h"
#include "designer/DesignFormView.h"
#include "model/Component.h"
#include "palette/LibraryLoader.h"
#include "palette/PaletteCatalog.h"
#include "palette/PaletteEntry.h"

namespace {

constexpr int32 kColumns = 25;

} // namespace

bool
LoadStandardComponents()
{
	BPath folder;
	TLibraryLoader loader(&PaletteCatalog());
	if (FindComponentsFolder(&folder) == B_OK)
		loader.LoadFolder(folder.Path());
	if (PaletteCatalog().FindPalEntry("TButton") != nullptr)
		return true;
	fprintf(stderr, "%s: the standard component library is not here\n", folder.Path());
	return false;
}


void
PlaceButtons(TDesignForm* form, int32 count)
{
	TPaletteEntry* entry = PaletteCatalog().FindPalEntry("TButton");
	for (int32 i = 0; i < count; i++) {
		const float left = 8 + 88 * (i % kColumns);
		const float top = 8 + 32 * (i / kColumns);
		const BRect frame(left, top, left + 80, top + 24);
		// Named by the loop: finding the first free name would make the benchmark's set-up quadratic.
		TComponent* component = entry->CreateComponent(form->View(), form->View(), frame);
		BString name("Button");
		name << i + 1;
		component->SetPropertyValue("Name", name.String());
		component->SetPropertyValue("Label", name.String());
		component->SetEventSelection("OnClick", true);
		form->AddComponent(component);
		form->UpdateComponentPosition(component, frame);
	}
}


void
SilenceOutput()
{
	if (freopen("/dev/null", "w", stdout) == nullptr)
		perror("/dev/null");
}
