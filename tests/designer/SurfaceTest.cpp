// SPDX-License-Identifier: MIT

#include "designer/SurfaceTest.h"

#include <condition_variable>
#include <cstdlib>
#include <cstring>
#include <mutex>

#include <Autolock.h>
#include <ListView.h>

#include "app/Dialogs.h"
#include "app/MainWindow.h"
#include "app/PlimApp.h"
#include "app/Preferences.h"
#include "app/WindowGuard.h"
#include "model/Property.h"
#include "palette/ComponentPalette.h"
#include "palette/PaletteCatalog.h"
#include "palette/PaletteEntry.h"
#include "project/Project.h"
#include "props/PropertyListItem.h"
#include "support/ComponentLibraries.h"

extern "C" int32 be_count_lock_violations();

namespace {

const BPoint kFirstPlace(250, 100);
const BPoint kSecondPlace(250, 420);

std::mutex sLock;
std::vector<std::string> sBoxes;
int32 sAnswer;


int32
NoteBox(const char* title, const char* text, const char*)
{
	std::lock_guard<std::mutex> lock(sLock);
	sBoxes.push_back(std::string(title) + "|" + text);
	return sAnswer;
}


/// There is no room for all windows beside each other.
void
Hide(BWindow* window)
{
	BAutolock lock(window);
	window->Hide();
}


int32
IntegerIn(const std::string& text)
{
	return static_cast<int32>(strtol(text.c_str(), nullptr, 10));
}

} // namespace


SurfaceTest::SurfaceTest()
	: fForm(nullptr)
{
	setenv("XDG_DATA_HOME", fFolder.Make("data").c_str(), 1);
	AppSettings.LeaveFileAlone();
	AppSettings.MakeEmpty();
	sBoxes.clear();
	sAnswer = 0;
	SetMessageBoxHook(NoteBox);
	if (PaletteCatalog().CountPalEntries() == 0)
		LoadComponentLibraries();
	PaletteCatalog().SetDropEntry(nullptr);

	std::mutex lock;
	std::condition_variable changed;
	bool isMade = false;
	fApplication = std::thread([&] {
		PlimApp app;
		{
			std::lock_guard<std::mutex> guard(lock);
			isMade = true;
			changed.notify_one();
		}
		app.Run();
	});
	std::unique_lock<std::mutex> guard(lock);
	changed.wait(guard, [&] { return isMade; });

	fForm = MainWindow()->ProjectWindow()->Project()->FormAt(0);
	Hide(MainWindow()->ProjectWindow());
	Hide(MainWindow()->Palette());
	Locked([this] { fForm->MoveTo(kFirstPlace); });
	WorkOn(fForm);
}


SurfaceTest::~SurfaceTest()
{
	be_app_messenger.SendMessage(B_QUIT_REQUESTED);
	fApplication.join();
	SetMessageBoxHook(nullptr);
	EXPECT_EQ(be_count_lock_violations(), 0);
}


TDesignForm*
SurfaceTest::NewForm()
{
	TDesignForm* form = MainWindow()->ProjectWindow()->Project()->NewForm();
	{
		BAutolock lock(form);
		form->MoveTo(kSecondPlace);
	}
	fRobot.Settle();
	WorkOn(fForm);
	return form;
}


void
SurfaceTest::WorkOn(TDesignForm* form)
{
	fForm = form;
	Locked([form] { form->Activate(); });
	fRobot.SetWindow(BMessenger(form));
	fRobot.Settle();
}


void
SurfaceTest::Choose(const char* className)
{
	TPaletteEntry* entry = PaletteCatalog().FindPalEntry(className);
	ASSERT_NE(entry, nullptr) << className;
	PaletteCatalog().SetDropEntry(entry);
}


TComponent*
SurfaceTest::Draw(const char* className, BRect frame)
{
	int32 count = 0;
	Locked([&] { count = fForm->CountComponents(); });
	Choose(className);
	fRobot.Drag(frame.LeftTop(), frame.RightBottom());
	fRobot.Settle();
	TComponent* component = nullptr;
	Locked([&] { component = fForm->ComponentAt(count); });
	return component;
}


void
SurfaceTest::Locked(const std::function<void()>& task) const
{
	WindowGuard guard(fForm);
	ASSERT_TRUE(guard.IsLocked());
	task();
}


TComponent*
SurfaceTest::Find(const char* name) const
{
	TComponent* found = nullptr;
	Locked([&] {
		for (int32 i = 0; i < fForm->CountComponents(); i++) {
			if (strcmp(fForm->ComponentAt(i)->ComponentName(), name) == 0)
				found = fForm->ComponentAt(i);
		}
	});
	return found;
}


std::string
SurfaceTest::Names() const
{
	std::string names;
	Locked([&] {
		for (int32 i = 0; i < fForm->CountComponents(); i++)
			names += (i > 0 ? " " : "") + std::string(fForm->ComponentAt(i)->ComponentName());
	});
	return names;
}


BRect
SurfaceTest::Frame(TComponent* component) const
{
	BRect frame;
	Locked([&] { frame = component->DTView()->Frame(); });
	return frame;
}


BRect
SurfaceTest::FrameOnForm(TComponent* component) const
{
	BRect frame;
	Locked([&] {
		BView* view = component->DTView();
		frame = fForm->View()->ConvertFromScreen(view->ConvertToScreen(view->Bounds()));
	});
	return frame;
}


BRect
SurfaceTest::ToldFrame(TComponent* component) const
{
	return BRect(IntegerIn(Value(component, "Left")), IntegerIn(Value(component, "Top")),
		IntegerIn(Value(component, "Right")), IntegerIn(Value(component, "Bottom")));
}


std::string
SurfaceTest::Value(TComponent* component, const char* property) const
{
	std::string value;
	Locked([&] { value = component->FindProperty(property)->Value(); });
	return value;
}


bool
SurfaceTest::IsSelected(TComponent* component) const
{
	bool isSelected = false;
	Locked([&] { isSelected = component->IsDesignerSelected(); });
	return isSelected;
}


std::string
SurfaceTest::Parent(TComponent* component) const
{
	std::string parent;
	Locked([&] {
		for (int32 i = 0; i < fForm->CountComponents(); i++) {
			if (fForm->ComponentAt(i)->DTView() == component->DTView()->Parent())
				parent = fForm->ComponentAt(i)->ComponentName();
		}
	});
	return parent;
}


std::string
SurfaceTest::Children(TComponent* container) const
{
	std::string names;
	Locked([&] {
		TComponentOwner* owner = dynamic_cast<TComponentOwner*>(container);
		for (int32 i = 0; owner != nullptr && i < owner->CountComponents(); i++)
			names += (i > 0 ? " " : "") + std::string(owner->ComponentAt(i)->ComponentName());
	});
	return names;
}


bool
SurfaceTest::IsModified() const
{
	bool isModified = false;
	Locked([&] { isModified = fForm->Modified(); });
	return isModified;
}


void
SurfaceTest::SetModified(bool modified) const
{
	Locked([&] {
		fForm->View()->SetModified(modified);
		fForm->TFormComponent::SetModified(modified);
	});
}


PropertyWin*
SurfaceTest::Inspector() const
{
	return MainWindow()->PropertyWindow();
}


TComponent*
SurfaceTest::Shown() const
{
	BAutolock lock(Inspector());
	return Inspector()->Component();
}


void
SurfaceTest::Invoke(const char* property)
{
	BPoint place(-1, -1);
	{
		WindowGuard guard(Inspector());
		ASSERT_TRUE(guard.IsLocked());
		auto* list = dynamic_cast<BListView*>(Inspector()->FindView("lvProperties"));
		for (int32 i = 0; i < list->CountItems(); i++) {
			if (strcmp(static_cast<TPropertyListItem*>(list->ItemAt(i))->Name(), property) != 0)
				continue;
			list->ScrollTo(i);
			place = list->ItemFrame(i).LeftTop() + BPoint(20, 5);
			list->ConvertToScreen(&place);
			Inspector()->ConvertFromScreen(&place);
		}
		Inspector()->Activate();
	}
	ASSERT_GE(place.x, 0) << property;
	ASSERT_TRUE(fRobot.WaitForWindow("Properties"));
	fRobot.Settle();
	fRobot.Click(place, 2);
	fRobot.Settle();
}


bool
SurfaceTest::ChooseFromMenu(BPoint where, const char* label)
{
	fRobot.Click(where, 1, B_SECONDARY_MOUSE_BUTTON);
	const bool wasFound = fRobot.ClickItem(label);
	if (!wasFound)
		fRobot.Key("escape");
	return fRobot.Settle() && wasFound;
}


void
SurfaceTest::Answer(int32 button)
{
	std::lock_guard<std::mutex> lock(sLock);
	sAnswer = button;
}


std::vector<std::string>
SurfaceTest::Boxes()
{
	std::lock_guard<std::mutex> lock(sLock);
	return sBoxes;
}
