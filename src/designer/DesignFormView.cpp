// SPDX-License-Identifier: MIT

#include "designer/DesignFormView.h"

#include <cstring>

#include <FilePanel.h>
#include <PopUpMenu.h>

#include "designer/DesignForm.h"
#include "designer/FormHost.h"
#include "designer/Inspector.h"
#include "model/Diagnostics.h"
#include "palette/PaletteCatalog.h"
#include "palette/PaletteEntry.h"
#include "props/ForgottenEditors.h"

namespace {

constexpr rgb_color kSurfaceColor = {216, 216, 216, 255};
constexpr rgb_color kSelectionColor = {0, 200, 200, 255};

} // namespace

TDesignFormView::TDesignFormView(BRect frame, TDesignForm* form)
	: BView(frame, "vwDesign", B_FOLLOW_ALL_SIDES, B_WILL_DRAW),
	  fForm(form),
	  fFilename(),
	  fIsIncomplete(false),
	  fCopyId(0),
	  fCopyIsDue(false),
	  fModified(false),
	  fIsMainForm(false)
{
	SetClassName("TForm");
	SetViewColor(kSurfaceColor);
	SetDTView(this);
	SetDTFormView(this);
}


TDesignFormView::~TDesignFormView()
{
	for (int32 i = 0; i < TFormDesigner::CountComponents(); i++)
		NoteEditors(TFormDesigner::ComponentAt(i));
	TFormDesigner::ClearComponents(true);
	if (fEditors != nullptr)
		Inspector::Bury(std::move(fEditors));
}


void
TDesignFormView::NoteEditors(const TComponent* component)
{
	if (fEditors == nullptr)
		fEditors = std::make_unique<TForgottenEditors>();
	fEditors->Add(component);
}


void
TDesignFormView::Draw(BRect updateRect)
{
	BView::Draw(updateRect);
	if (!fForm->IsDesignerSelected())
		return;

	const BRect bounds = Bounds();
	const BPoint corners[] = {BPoint(0, 0), BPoint(bounds.Width(), 0),
		BPoint(bounds.Width(), bounds.Height()), BPoint(0, bounds.Height())};
	BeginLineArray(4);
	for (int32 i = 0; i < 4; i++)
		AddLine(corners[i], corners[(i + 1) % 4], kSelectionColor);
	EndLineArray();
}


bool
TDesignFormView::PropertyModified(const char* name, const char*, const char* newValue)
{
	if (name == nullptr || newValue == nullptr || strcmp(name, "Name") != 0)
		return true;
	fForm->SetComponentName(newValue);
	if (fForm->Host() != nullptr)
		fForm->Host()->ObjectNameChanged(fForm);
	return true;
}


void
TDesignFormView::SetModified(bool modified)
{
	fModified = modified;
	if (modified) {
		WantCopy();
		return;
	}
	for (int32 i = 0; i < TFormDesigner::CountComponents(); i++) {
		TComponent* component = TFormDesigner::ComponentAt(i);
		if (component->Modified())
			component->SetModified(false);
	}
}


bool
TDesignFormView::Modified() const
{
	if (fModified)
		return true;
	for (int32 i = 0; i < TFormDesigner::CountComponents(); i++) {
		if (TFormDesigner::ComponentAt(i)->Modified())
			return true;
	}
	return false;
}


bool
TDesignFormView::ComponentPropertyModified(TComponent*, const char*, const char*, const char*)
{
	SetModified(true);
	return true;
}


void
TDesignFormView::ComponentModified(TComponent*)
{
	WantCopy();
}


bool
TDesignFormView::IsDropWaiting()
{
	return PaletteCatalog().DropEntry() != nullptr;
}


TComponent*
TDesignFormView::CreateComponent(BView* parent, BRect frame)
{
	TPaletteEntry* entry = PaletteCatalog().DropEntry();
	if (entry == nullptr)
		return nullptr;

	TComponent* component = entry->CreateComponent(parent, this, frame);
	if (component == nullptr) {
		PrintDiagnostic("No component returned from CreateComponent()\n");
		return nullptr;
	}

	NameComponent(component, frame);
	PrintDiagnostic("Creating Component '%s'\n", component->ComponentName());
	AddComponent(component);
	SetModified(true);
	SelectNew(component);
	return component;
}


void
TDesignFormView::DoneDroppingComponent()
{
	PaletteCatalog().SetDropEntry(nullptr);
}
