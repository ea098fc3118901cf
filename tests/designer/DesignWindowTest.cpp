// SPDX-License-Identifier: MIT
// Tests of a design form's window: its frame, what the property window shows of it, and what it looks like.

#include "designer/SurfaceTest.h"

#include <Autolock.h>
#include <Entry.h>
#include <Message.h>
#include <Messenger.h>

#include "app/MainWindow.h"
#include "app/WindowGuard.h"
#include "model/Property.h"
#include "project/Project.h"
#include "project/ProjectView.h"
#include "support/Printers.h"

namespace {

constexpr bigtime_t kLimit = 60 * 1000000;
constexpr rgb_color kSelectionColor = {0, 200, 200, 255};

} // namespace

class DesignWindowTest : public SurfaceTest {
protected:
	/// As the property window does.
	void Edit(TComponent* component, const char* property, const char* value)
	{
		Locked([&] { component->FindProperty(property)->Editor()->SetValue(value, true); });
		fRobot.Settle();
	}

	BRect WindowFrame() const
	{
		BRect frame;
		Locked([&] { frame = Form()->Frame(); });
		return frame;
	}

	void CheckWindow(BRect frame)
	{
		EXPECT_EQ(WindowFrame(), frame);
		EXPECT_EQ(ToldFrame(Form()), frame);
		Locked([&] {
			for (const char* name : {"Left", "Top", "Right", "Bottom"})
				EXPECT_STREQ(Form()->TFormComponent::GetPropertyValue(name),
					Form()->FindProperty(name)->Value())
					<< name;
		});
	}

	void Close(TDesignForm* form)
	{
		form->PostMessage(B_QUIT_REQUESTED);
		fRobot.Settle();
	}

	static std::string Ask(TDesignForm* form, BMessage* message, bool* result)
	{
		BMessage reply;
		*result = false;
		EXPECT_EQ(BMessenger(form).SendMessage(message, &reply, kLimit, kLimit), B_OK);
		EXPECT_EQ(reply.what, message->what);
		EXPECT_EQ(reply.FindBool("result", result), B_OK);
		return reply.GetString("formname", "");
	}
};


// #pragma mark - Frame


TEST_F(DesignWindowTest, ATypedEdgeMovesTheWindow)
{
	Edit(Form(), "Left", "200");
	CheckWindow(BRect(200, 100, 500, 400));
	Edit(Form(), "Top", "150");
	CheckWindow(BRect(200, 150, 500, 450));
	Edit(Form(), "Right", "450");
	CheckWindow(BRect(200, 150, 450, 450));
	Edit(Form(), "Bottom", "400");
	CheckWindow(BRect(200, 150, 450, 400));
	EXPECT_TRUE(IsModified());
	Edit(Form(), "Left", "20 pixels");
	CheckWindow(BRect(20, 150, 270, 400));
}


TEST_F(DesignWindowTest, AMovedWindowTellsItsEdges)
{
	SetModified(false);
	Locked([&] { Form()->MoveTo(260, 170); });
	fRobot.Settle();
	CheckWindow(BRect(260, 170, 560, 470));
	EXPECT_TRUE(IsModified());
	Locked([&] { Form()->ResizeTo(200, 220); });
	fRobot.Settle();
	CheckWindow(BRect(260, 170, 460, 390));
}


TEST_F(DesignWindowTest, AFormThatIsNotActiveIsNotChangedByItsFrame)
{
	SetModified(false);
	{
		BAutolock lock(Inspector());
		Inspector()->Activate();
	}
	fRobot.Settle();
	Locked([&] { Form()->MoveTo(260, 170); });
	fRobot.Settle();
	CheckWindow(BRect(260, 170, 560, 470));
	EXPECT_FALSE(IsModified());
}


TEST_F(DesignWindowTest, TheRightEdgeMayBeLeftOfTheLeftOne)
{
	Edit(Form(), "Right", "100");
	const BRect frame = WindowFrame();
	EXPECT_TRUE(frame.IsValid());
	CheckWindow(frame);
}


TEST_F(DesignWindowTest, TitleAndColoursFollow)
{
	Edit(Form(), "Title", "Hello");
	Edit(Form(), "ViewColor", "{10,20,30,255}");
	Locked([&] {
		EXPECT_STREQ(Form()->Title(), "Hello");
		EXPECT_EQ(Form()->View()->ViewColor(), (rgb_color{10, 20, 30, 255}));
	});
	Edit(Form(), "ViewColor", "{216,216,216,255}");
}


TEST_F(DesignWindowTest, ANewNameReachesTheProject)
{
	Edit(Form(), "Name", "MainWindow");
	Locked([&] { EXPECT_STREQ(Form()->ComponentName(), "MainWindow"); });
	EXPECT_EQ(MainWindow()->ProjectWindow()->Project()->FindForm("MainWindow"), Form());
	EXPECT_TRUE(IsModified());
}


// #pragma mark - The property window


TEST_F(DesignWindowTest, AnActiveFormIsShown)
{
	TDesignForm* first = Form();
	TDesignForm* second = NewForm();
	EXPECT_EQ(Shown(), first);
	WorkOn(second);
	EXPECT_EQ(Shown(), second);
	EXPECT_TRUE(IsSelected(second));
	BAutolock lock(Inspector());
	EXPECT_EQ(Inspector()->DesignView(), second->View());
}


TEST_F(DesignWindowTest, AFormThatIsLeftSelectsNothing)
{
	TComponent* button = Draw("TButton", BRect(20, 30, 120, 60));
	EXPECT_TRUE(IsSelected(button));
	{
		BAutolock lock(Inspector());
		Inspector()->Activate();
	}
	fRobot.Settle();
	EXPECT_FALSE(IsSelected(button));
	EXPECT_FALSE(IsSelected(Form()));
	EXPECT_EQ(Shown(), button);
}


TEST_F(DesignWindowTest, AClosedFormIsHiddenAndStays)
{
	Close(Form());
	EXPECT_TRUE(Form()->IsHidden());
	EXPECT_EQ(MainWindow()->ProjectWindow()->Project()->CountForms(), 1);
	EXPECT_EQ(Shown(), nullptr);
	{
		BAutolock lock(Inspector());
		EXPECT_EQ(Inspector()->DesignView(), nullptr);
	}

	Locked([&] { Form()->Show(); });
	fRobot.Settle();
	EXPECT_EQ(Shown(), Form());
}


TEST_F(DesignWindowTest, AClosedFormsComponentIsShownNoLonger)
{
	TComponent* button = Draw("TButton", BRect(20, 30, 120, 60));
	EXPECT_EQ(Shown(), button);
	Close(Form());
	EXPECT_EQ(Shown(), nullptr);
}


TEST_F(DesignWindowTest, ClosingLeavesOtherFormsShown)
{
	TDesignForm* first = Form();
	TDesignForm* second = NewForm();
	WorkOn(second);
	Locked([&] {});
	first->PostMessage(B_QUIT_REQUESTED);
	fRobot.Settle();
	EXPECT_TRUE(first->IsHidden());
	EXPECT_EQ(Shown(), second);
}


TEST_F(DesignWindowTest, ARemovedFormIsForgotten)
{
	TDesignForm* first = Form();
	WorkOn(NewForm());
	TComponent* button = Draw("TButton", BRect(20, 30, 120, 60));
	EXPECT_EQ(Shown(), button);
	TDesignForm* second = Form();
	WorkOn(first);
	WorkOn(second);
	fRobot.Click(BPoint(60, 45));
	EXPECT_EQ(Shown(), button);
	MainWindow()->ProjectWindow()->Project()->RemoveForm(second);
	EXPECT_NE(Shown(), button);
	WorkOn(first);
	EXPECT_EQ(Shown(), first);
}


// #pragma mark - Messages


TEST_F(DesignWindowTest, FormsAreSavedAndLoadedByMessage)
{
	Draw("TButton", BRect(20, 30, 120, 60));
	BMessage save(DFM_SAVEFILE);
	bool result;
	Ask(Form(), &save, &result);
	EXPECT_FALSE(result);
	Locked([&] { Form()->SetFilename((fFolder / "a.frm").c_str()); });
	Ask(Form(), &save, &result);
	EXPECT_TRUE(result);
	EXPECT_FALSE(IsModified());

	WorkOn(NewForm());
	BMessage load(DFM_LOADFILE);
	EXPECT_EQ(Ask(Form(), &load, &result), "Form2");
	EXPECT_FALSE(result);
	load.AddString("filename", (fFolder / "a.frm").c_str());
	EXPECT_EQ(Ask(Form(), &load, &result), "Form1");
	EXPECT_TRUE(result);
	fRobot.Settle();
	EXPECT_EQ(Names(), "Button1");
	// The window took the place that the file tells, which is no change of the user's.
	EXPECT_EQ(WindowFrame().LeftTop(), BPoint(250, 100));
	EXPECT_FALSE(IsModified());
}


TEST_F(DesignWindowTest, DroppedFilesAreIgnored)
{
	BMessage dropped(B_SIMPLE_DATA);
	entry_ref ref;
	get_ref_for_path("/", &ref);
	dropped.AddRef("refs", &ref);
	BMessenger(Form()).SendMessage(&dropped);
	fRobot.Settle();
	EXPECT_EQ(MainWindow()->ProjectWindow()->Project()->CountForms(), 1);
	EXPECT_TRUE(Boxes().empty());
}


// #pragma mark - Drawing


TEST_F(DesignWindowTest, TheSelectedFormHasABorder)
{
	fRobot.Click(BPoint(200, 200));
	const WindowPicture selected = fRobot.Picture();
	ASSERT_EQ(selected.width, 301);
	EXPECT_EQ(selected.Count(BRect(0, 0, 300, 0), kSelectionColor), 301);
	EXPECT_EQ(selected.Count(BRect(0, 300, 300, 300), kSelectionColor), 301);
	EXPECT_EQ(selected.Count(BRect(0, 0, 0, 300), kSelectionColor), 301);
	EXPECT_EQ(selected.Count(BRect(300, 0, 300, 300), kSelectionColor), 301);
	EXPECT_EQ(selected.Count(BRect(1, 1, 299, 299), kSelectionColor), 0);

	Draw("TButton", BRect(20, 30, 120, 60));
	EXPECT_EQ(fRobot.Picture().Count(BRect(0, 0, 300, 0), kSelectionColor), 0);
}


TEST_F(DesignWindowTest, TheBorderFollowsTheWindow)
{
	fRobot.Click(BPoint(200, 200));
	Locked([&] { Form()->ResizeTo(200, 220); });
	fRobot.Settle();
	const WindowPicture selected = fRobot.Picture();
	EXPECT_EQ(selected.Count(BRect(0, 0, 200, 220), kSelectionColor), 2 * 201 + 2 * 219);
	EXPECT_EQ(selected.Count(BRect(1, 1, 199, 219), kSelectionColor), 0);
}


TEST_F(DesignWindowTest, ASelectedComponentHasABorderAndAHandle)
{
	for (const char* className : {"TButton", "TCheckBox", "TTextControl", "TStringView", "TBox"}) {
		const BRect frame(20, 30, 120, 90);
		TComponent* component = Draw(className, frame);
		const WindowPicture selected = fRobot.Picture();
		const auto isMarked = [&](float x, float y) {
			const rgb_color color = selected.At(x, y);
			return color.red == 0 && color.green == 200 && color.blue == 200;
		};
		EXPECT_TRUE(isMarked(20, 30)) << className;
		EXPECT_TRUE(isMarked(120, 30)) << className;
		EXPECT_TRUE(isMarked(20, 90)) << className;
		EXPECT_TRUE(isMarked(70, 30)) << className;
		EXPECT_TRUE(isMarked(20, 60)) << className;
		EXPECT_TRUE(isMarked(120, 60)) << className;
		EXPECT_EQ(selected.Count(BRect(115, 85, 120, 90), kSelectionColor), 36) << className;
		EXPECT_FALSE(isMarked(114, 86)) << className;
		EXPECT_FALSE(isMarked(116, 84)) << className;

		// Larger: the mark goes with the corner.
		fRobot.Drag(BPoint(118, 88), BPoint(200, 150));
		EXPECT_EQ(Frame(component), BRect(20, 30, 200, 150)) << className;
		const WindowPicture larger = fRobot.Picture();
		EXPECT_EQ(larger.Count(BRect(195, 145, 200, 150), kSelectionColor), 36) << className;
		EXPECT_EQ(larger.Count(BRect(22, 32, 194, 144), kSelectionColor), 0) << className;
		EXPECT_EQ(larger.Count(frame, kSelectionColor), 101 + 60) << className;

		fRobot.Click(BPoint(280, 280));
		EXPECT_EQ(fRobot.Picture().Count(BRect(1, 1, 299, 299), kSelectionColor), 0) << className;
		ASSERT_TRUE(ChooseFromMenu(BPoint(60, 45), "Delete"));
	}
}
