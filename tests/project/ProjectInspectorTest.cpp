// SPDX-License-Identifier: MIT
// What the property window shows of the project, in the running designer.

#include <atomic>

#include <OS.h>

#include "app/DesignerRun.h"
#include "app/MainWindow.h"
#include "app/WindowGuard.h"
#include "designer/DesignForm.h"
#include "designer/DesignFormView.h"
#include "model/AppComponent.h"
#include "model/Property.h"
#include "project/Project.h"
#include "project/ProjectView.h"
#include "project/ProjectWin.h"
#include "props/PropertyWin.h"
#include "props/StringProperty.h"

namespace {

/// No window handles it: answered when the messages before it have been handled.
constexpr uint32 kMsgAreYouDone = '_don';

std::atomic<int> sDeletedEditors = 0;


class CountedEditor : public TStringProperty {
public:
	using TStringProperty::TStringProperty;
	~CountedEditor() override { sDeletedEditors++; }
};


/// Gives \a component one more property, with an editor that is counted.
void
AddCounted(TComponent* component)
{
	TProperty* property = new TProperty(component, "Counted", "", nullptr, false);
	component->AddPropAndEditor(
		property, new CountedEditor(component, property), nullptr, nullptr, false);
}


class ProjectInspectorTest : public DesignerTest {
protected:
	static ProjectWin* Window() { return MainWindow()->ProjectWindow(); }
	static TDesignForm* FormAt(int32 index) { return Window()->Project()->FormAt(index); }

	static TComponent* Shown()
	{
		WindowGuard guard(MainWindow()->PropertyWindow());
		return MainWindow()->PropertyWindow()->Component();
	}

	static BView* DesignView()
	{
		WindowGuard guard(MainWindow()->PropertyWindow());
		return MainWindow()->PropertyWindow()->DesignView();
	}

	void Select(int32 row)
	{
		// A new form shows itself when its window becomes active, which must not come after this.
		ASSERT_TRUE(fRobot.Settle());
		{
			WindowGuard guard(Window());
			ASSERT_TRUE(guard.IsLocked());
			Window()->View()->DeselectAll();
			Window()->View()->Select(row);
		}
		// Behind the list's own message.
		Tell(BMessenger(Window()), PM_SELECTED);
	}
};

} // namespace


TEST_F(ProjectInspectorTest, ShowsTheComponentOfTheSelectedRow)
{
	Run([this] {
		Select(0);
		EXPECT_EQ(Shown(), Window()->View()->AppComponent());
		// The application is edited with the project's window locked, whether or not there is a form.
		EXPECT_EQ(DesignView(), Window()->View());
		Select(1);
		EXPECT_EQ(Shown(), static_cast<TComponent*>(FormAt(0)));
		EXPECT_EQ(DesignView(), FormAt(0)->View());
	});
}


TEST_F(ProjectInspectorTest, ForgetsAFormThatIsRemoved)
{
	Run([this] {
		Select(1);
		Tell(BMessenger(Window()), PM_REMOVE_FORM);
		EXPECT_EQ(Window()->Project()->CountForms(), 0);
		EXPECT_EQ(Shown(), nullptr);
		EXPECT_EQ(DesignView(), nullptr);
	});
}


TEST_F(ProjectInspectorTest, KeepsWhatIsNotRemoved)
{
	Run([this] {
		Tell(BMessenger(Window()), PM_NEW_FORM);
		Tell(BMessenger(Window()), PM_NEW_FORM);
		Select(2);
		TDesignForm* first = FormAt(0);
		const BMessenger second(FormAt(1));
		EXPECT_EQ(Shown(), static_cast<TComponent*>(FormAt(1)));
		Window()->Project()->RemoveForm(first);
		EXPECT_EQ(Shown(), static_cast<TComponent*>(FormAt(0)));
		EXPECT_TRUE(second.IsValid());
	});
}


TEST_F(ProjectInspectorTest, ShowsTheApplicationOfANewProject)
{
	Run([this] {
		Select(1);
		Window()->NewProject(false);
		EXPECT_EQ(Shown(), Window()->View()->AppComponent());
		EXPECT_EQ(DesignView(), Window()->View());
	});
}


TEST_F(ProjectInspectorTest, OutlivesTheProjectsThatItShows)
{
	const std::string path = fFolder / "test.plim";
	Run([this, &path] {
		for (int32 i = 0; i < 3; i++)
			Tell(BMessenger(Window()), PM_NEW_FORM);
		for (int32 i = 0; i < 4; i++) {
			const std::string file = fFolder / ("form" + std::to_string(i) + ".frm");
			WindowGuard guard(FormAt(i));
			FormAt(i)->SetFilename(file.c_str());
		}
		ASSERT_TRUE(Window()->SaveToFile(path.c_str(), true));
		for (int32 i = 0; i < 8; i++) {
			Select(i % 5);
			ASSERT_TRUE(Window()->LoadFromFile(path.c_str()));
			MainWindow()->PropertyWindow()->UpdateDisplayValues();
			Select(4 - i % 5);
		}
		EXPECT_EQ(Window()->Project()->CountForms(), 4);
		EXPECT_TRUE(Boxes().empty());
	});
}


TEST_F(ProjectInspectorTest, TheEditorsOfFormsAndApplicationGoWithThem)
{
	sDeletedEditors = 0;
	Run([] {
		{
			WindowGuard guard(FormAt(0));
			AddCounted(FormAt(0));
		}
		{
			WindowGuard guard(Window());
			AddCounted(Window()->Project()->App());
		}
		Window()->NewProject(false);
		// They go in the property window's thread.
		Tell(BMessenger(MainWindow()->PropertyWindow()), kMsgAreYouDone);
		EXPECT_EQ(sDeletedEditors, 2);
	});
}
