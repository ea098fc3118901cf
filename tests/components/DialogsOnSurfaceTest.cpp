// SPDX-License-Identifier: MIT
// A property's dialog that is still open when what it edits goes, in the running designer. It stays until the user
// closes it, and OK is for nobody then.

#include <Application.h>
#include <Button.h>
#include <OS.h>

#include "app/MainWindow.h"
#include "app/WindowGuard.h"
#include "designer/SurfaceTest.h"
#include "model/Component.h"
#include "model/Property.h"
#include "project/Project.h"
#include "project/ProjectOperation.h"
#include "props/PropertyEditor.h"

namespace {

struct property_dialog {
	const char* className; // none: the form's own
	const char* property;
	const char* title;
	BRect frame; // of the component that is made for it
};

const property_dialog kDialogs[] = {
	{"TButton", "Flags", "View Flags", BRect(20, 20, 140, 60)},
	{"TButton", "ViewColor", "Color", BRect(20, 80, 140, 120)},
	{"TGauge", "Zones", "Zones", BRect(20, 140, 140, 260)},
	{nullptr, "WindowFlags", "Window Flags", BRect()},
};

constexpr bigtime_t kStep = 1000; // microseconds
constexpr int32 kMostSteps = 20000;


/// Waits, within a limit, until \a condition holds.
template <typename Condition>
bool
WaitUntil(Condition condition)
{
	for (int32 i = 0; i < kMostSteps; i++) {
		if (condition())
			return true;
		snooze(kStep);
	}
	return false;
}

} // namespace


class DialogsOnSurfaceTest : public SurfaceTest {
protected:
	static TProject* Project() { return MainWindow()->ProjectWindow()->Project(); }

	/// The editor of the dialog's property, of a new component or the form.
	TPropertyEditor* EditorOf(const property_dialog& dialog)
	{
		TComponent* component = Form();
		if (dialog.className != nullptr)
			component = Draw(dialog.className, dialog.frame);
		TPropertyEditor* editor = nullptr;
		Locked([&] { editor = component->FindProperty(dialog.property)->Editor(); });
		return editor;
	}

	/// Opens the dialog as the user does; the robot works on it then.
	void Open(const property_dialog& dialog)
	{
		EditorOf(dialog);
		Invoke(dialog.property);
		ASSERT_TRUE(fRobot.WaitForWindow(dialog.title)) << dialog.title;
	}

	/// Opens all of them, as a user cannot.
	std::vector<BMessenger> OpenAll()
	{
		std::vector<BMessenger> dialogs;
		std::vector<TPropertyEditor*> editors;
		for (const property_dialog& dialog : kDialogs)
			editors.push_back(EditorOf(dialog));
		for (size_t i = 0; i < editors.size(); i++) {
			Locked([&] { EXPECT_TRUE(editors[i]->ModalEdit()); });
			EXPECT_TRUE(fRobot.WaitForWindow(kDialogs[i].title)) << kDialogs[i].title;
			dialogs.push_back(fRobot.Window());
		}
		return dialogs;
	}

	void Confirm(const property_dialog& dialog)
	{
		EXPECT_TRUE(fRobot.ClickView("btnOK"));
		EXPECT_TRUE(fRobot.WaitForNoWindow(dialog.title)) << dialog.title;
	}

	/// Works on a new project's form.
	void StartAgain()
	{
		MainWindow()->ProjectWindow()->NewProject(true);
		WorkOn(Project()->FormAt(0));
	}

	/// All values of the form and of what is on it.
	static std::string Values(TDesignForm* form)
	{
		std::string values;
		WindowGuard guard(form);
		for (int32 i = -1; i < form->CountComponents(); i++) {
			const TComponent* component = i < 0 ? form : form->ComponentAt(i);
			for (int32 k = 0; k < component->CountProperties(); k++)
				values += std::string(component->PropertyAt(k)->Value()) + "\n";
		}
		return values;
	}
};


TEST_F(DialogsOnSurfaceTest, OutlivesTheProjectThatIsClosed)
{
	// Without saving.
	Answer(1);
	for (const property_dialog& dialog : kDialogs) {
		Open(dialog);
		ASSERT_TRUE(MainWindow()->ProjectWindow()->CloseProject());
		ASSERT_EQ(Project()->CountForms(), 0);
		Confirm(dialog);
		EXPECT_EQ(Project()->CountForms(), 0);
		StartAgain();
	}
}


TEST_F(DialogsOnSurfaceTest, LeavesTheProjectAloneThatTakesThePlaceOfItsOwn)
{
	const std::string path = fFolder / "test.plim";
	Locked([&] { Form()->SetFilename((fFolder / "form.frm").c_str()); });
	ASSERT_NE(Draw("TButton", BRect(160, 20, 280, 60)), nullptr);
	ASSERT_NE(Draw("TGauge", BRect(160, 80, 280, 200)), nullptr);
	ASSERT_TRUE(MainWindow()->ProjectWindow()->SaveToFile(path.c_str(), true));
	const std::string saved = Values(Form());
	for (const property_dialog& dialog : kDialogs) {
		Open(dialog);
		ASSERT_TRUE(MainWindow()->ProjectWindow()->LoadFromFile(path.c_str()));
		ASSERT_EQ(Project()->CountForms(), 1);
		Confirm(dialog);
		EXPECT_EQ(Values(Project()->FormAt(0)), saved);
		WorkOn(Project()->FormAt(0));
	}
}


TEST_F(DialogsOnSurfaceTest, OutlivesItsFormThatIsRemoved)
{
	for (const property_dialog& dialog : kDialogs) {
		Open(dialog);
		Project()->RemoveForm(Form());
		ASSERT_EQ(Project()->CountForms(), 0);
		Confirm(dialog);
		StartAgain();
	}
}


TEST_F(DialogsOnSurfaceTest, GoesWithTheDesigner)
{
	const std::vector<BMessenger> dialogs = OpenAll();
	be_app_messenger.SendMessage(B_QUIT_REQUESTED);
	for (const BMessenger& dialog : dialogs)
		EXPECT_TRUE(WaitUntil([&] { return !dialog.IsValid(); }));
}


TEST_F(DialogsOnSurfaceTest, IsConfirmedWhenThePropertyWindowHasGoneAlready)
{
	const std::vector<BMessenger> dialogs = OpenAll();
	// The project goes after the property window, and waits for this.
	TProjectOperation operation(Project());
	be_app_messenger.SendMessage(B_QUIT_REQUESTED);
	ASSERT_TRUE(WaitUntil([] { return MainWindow()->PropertyWindow() == nullptr; }));
	for (const BMessenger& dialog : dialogs) {
		BLooper* looper = nullptr;
		dialog.Target(&looper);
		{
			WindowGuard guard(looper);
			ASSERT_TRUE(guard.IsLocked());
			auto* window = static_cast<BWindow*>(looper);
			static_cast<BButton*>(window->FindView("btnOK"))->Invoke();
		}
		EXPECT_TRUE(WaitUntil([&] { return !dialog.IsValid(); }));
	}
}
