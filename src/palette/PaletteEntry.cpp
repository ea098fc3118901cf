// SPDX-License-Identifier: MIT

#include "palette/PaletteEntry.h"

#include <Alert.h>
#include <Button.h>
#include <Messenger.h>

namespace {

const BRect kButtonFrame(0, 0, 100, 24);

} // namespace

TPaletteEntry::TPaletteEntry(int32 entryNumber, const char* componentName, const char* className)
	: fEntryNumber(entryNumber),
	  fComponentName(componentName),
	  fClassName(className),
	  fButton(nullptr),
	  fComponent(nullptr)
{
}


TPaletteEntry::~TPaletteEntry() {}


TComponent*
TPaletteEntry::Component() const
{
	return fComponent;
}


TComponent*
TPaletteEntry::CreateComponent(BView*, TFormDesigner*, BRect)
{
	return fComponent;
}


const char*
TPaletteEntry::ComponentName() const
{
	return fComponentName;
}


void
TPaletteEntry::Init(BView* palette, BPoint position)
{
	BMessage* pressed = new BMessage(kPaletteEntryPressed);
	pressed->AddPointer("palEntry", this);

	fButton =
		new BButton(kButtonFrame.OffsetToCopy(position), fComponentName, fComponentName, pressed);
	if (!palette->LockLooper())
		return;
	palette->AddChild(fButton);
	fButton->SetTarget(palette);
	palette->UnlockLooper();
}


void
TPaletteEntry::GetButtonSize(BPoint* size)
{
	if (fButton != nullptr)
		fButton->GetPreferredSize(&size->x, &size->y);
}


const char*
TPaletteEntry::Copyright() const
{
	return "Your name here";
}


void
TPaletteEntry::About()
{
	BAlert* alert = new BAlert(fComponentName, Copyright(), "Okay");
	alert->Go(nullptr);
}
