// SPDX-License-Identifier: MIT
// One form with every component of the library: what it looks like while it is designed, and the program
// that is generated from it.

#include <algorithm>
#include <fstream>
#include <map>
#include <memory>
#include <regex>

#include <gtest/gtest.h>

#include <Application.h>
#include <Bitmap.h>
#include <TabView.h>
#include <TranslationUtils.h>
#include <View.h>

#include "codegen/CodeGenerator.h"
#include "designer/DesignForm.h"
#include "designer/DesignFormView.h"
#include "model/AppComponent.h"
#include "model/Event.h"
#include "model/Property.h"
#include "palette/PaletteCatalog.h"
#include "palette/PaletteEntry.h"
#include "support/CapturedOutput.h"
#include "support/Command.h"
#include "support/ComponentLibraries.h"
#include "support/Printers.h"
#include "support/Robot.h"
#include "support/TemporaryFolder.h"

namespace {

struct placement {
	const char* name;
	const char* className;
	BRect frame;
	const char* parent;
	std::vector<std::pair<const char*, const char*>> properties;
};

const char* const kPicture = PLIM_SOURCE_DIR "/docs/images/gallery/alert-info.png";

// The parents come first.
const placement kForm[] = {
	{"Menus", "TMenuBar", BRect(0, 0, 639, 22), "",
		{{"Items", "File|>Open|>-|>More|>>Quit|Edit|>Copy"}}},
	{"Push", "TButton", BRect(10, 30, 100, 56), "", {{"Label", "Push"}}},
	{"Tick", "TCheckBox", BRect(110, 30, 200, 50), "", {{"Label", "Tick"}, {"Checked", "true"}}},
	{"First", "TRadioButton", BRect(210, 30, 290, 50), "",
		{{"Label", "First"}, {"Checked", "true"}}},
	{"Second", "TRadioButton", BRect(300, 30, 380, 50), "", {{"Label", "Second"}}},
	{"Field", "TTextControl", BRect(400, 30, 620, 56), "",
		{{"Label", "Name:"}, {"Text", "Jo"}, {"Divider", "60"}}},
	{"Caption", "TStringView", BRect(10, 65, 200, 85), "",
		{{"Text", "A caption"}, {"Font", "be_bold_font"}, {"HighColor", "{180,0,0,255}"}}},
	{"Frame", "TBox", BRect(10, 95, 200, 195), "", {{"Label", "Box"}}},
	{"Inside", "TCheckBox", BRect(12, 25, 120, 45), "Frame", {{"Label", "Inside"}}},
	{"Plain", "TView", BRect(210, 65, 300, 125), "", {{"ViewColor", "{200,220,255,255}"}}},
	{"Leaf", "TButton", BRect(10, 10, 80, 36), "Plain", {{"Label", "Leaf"}}},
	{"Rows", "TListView", BRect(310, 65, 440, 165), "", {{"Items", "One|Two|Three"}}},
	{"Tree", "TOutlineListView", BRect(450, 65, 620, 165), "",
		{{"Items", "Fruit|>Apple|>Pear|Nuts|>Hazel"}}},
	{"Choice", "TMenuField", BRect(210, 135, 300, 160), "",
		{{"Items", "Red|Green|Blue"}, {"Selected", "1"}}},
	{"Range", "TSlider", BRect(210, 175, 420, 225), "",
		{{"Label", "Range"}, {"Maximum", "10"}, {"Value", "3"},
			{"HashMarks", "B_HASH_MARKS_BOTTOM"}, {"HashMarkCount", "11"}, {"MinimumLabel", "low"},
			{"MaximumLabel", "high"}, {"Filled", "true"}}},
	{"Progress", "TStatusBar", BRect(430, 175, 620, 220), "",
		{{"Label", "Done:"}, {"Text", "half"}, {"Value", "50"}}},
	{"Tint", "TColorControl", BRect(210, 235, 530, 320), "", {{"Color", "{20,140,200,255}"}}},
	{"Notes", "TTextView", BRect(10, 205, 200, 305), "",
		{{"Text", "Several words that are too long for a line"}, {"TextColor", "{0,0,160,255}"},
			{"FontSize", "12"}}},
	{"Photo", "TPictureView", BRect(10, 315, 200, 395), "",
		{{"File", kPicture}, {"Stretched", "true"}}},
	{"Scroll", "TScrollView", BRect(300, 330, 400, 400), "", {{"Horizontal", "false"}}},
	{"Long", "TListView", BRect(5, 5, 60, 60), "Scroll", {{"Items", "1|2|3|4|5|6|7|8|9"}}},
	{"Paper", "TScrollView", BRect(540, 235, 630, 320), "", {{"Border", "B_PLAIN_BORDER"}}},
	{"Near", "TCheckBox", BRect(10, 20, 70, 40), "Paper", {{"Label", "Near"}}},
	{"Pages", "TTabView", BRect(410, 325, 630, 410), "", {{"Tabs", "Alpha|Beta"}}},
	{"OnAlpha", "TCheckBox", BRect(15, 40, 100, 60), "Pages", {{"Label", "Alpha's"}}},
	{"OnBeta", "TCheckBox", BRect(110, 40, 200, 60), "Pages", {{"Label", "Beta's"}, {"Page", "1"}}},
	{"Speed", "TGauge", BRect(440, 415, 530, 505), "",
		{{"Maximum", "240"}, {"Value", "90"}, {"Unit", "km/h"}, {"Ticks", "8"},
			{"Zones", "0..120 {60,160,60,255}|120..240 {200,50,50,255}"}}},
	{"Hour", "TClock", BRect(545, 420, 625, 500), "", {{"Time", "16:45:20"}, {"Running", "false"}}},
	{"Icon", "TPictureButton", BRect(210, 330, 290, 380), "", {{"OffFile", kPicture}}},
};

const BPoint kBesideTheComponents(100, 450);

std::string
ReadFile(const std::string& path)
{
	std::ifstream file(path, std::ios::binary);
	return std::string(std::istreambuf_iterator<char>(file), {});
}

} // namespace

/// Designs the form in a window that is shown.
class ControlsProgramTest : public testing::Test {
protected:
	ControlsProgramTest()
	{
		CapturedOutput output;
		LoadComponentLibraries();
		fApp.SetPropertyValue("Name", "Controls");
		fApp.SetPropertyValue("GenerationPath", fFolder.Path().c_str());
		fForm = new TDesignForm("Form1", FORM_SHOWN);
		// It becomes active a little later, which selects the form in place of what is on it.
		fRobot.SetWindow(BMessenger(fForm));
		fRobot.Settle();
		Locked([&] {
			fApp.AddComponent(fForm);
			const std::pair<const char*, const char*> kValues[] = {
				{"Left", "100"}, {"Top", "100"}, {"Right", "739"}, {"Bottom", "609"}};
			for (const auto& [name, value] : kValues) {
				fForm->SetPropertyValue(name, value);
			}
			for (const placement& place : kForm)
				Place(place);
		});
		fRobot.Settle();
	}

	~ControlsProgramTest()
	{
		CapturedOutput output;
		if (fForm->Lock())
			fForm->Quit();
	}

	void Place(const placement& place)
	{
		TComponent* parent = fComponents[place.parent];
		PaletteCatalog().SetDropEntry(PaletteCatalog().FindPalEntry(place.className));
		TComponent* component = fForm->CreateComponent(
			parent != nullptr ? parent->DTView() : fForm->View(), place.frame);
		fForm->DoneDroppingComponent();
		if (parent != nullptr)
			dynamic_cast<TComponentOwner*>(parent)->AddComponent(component);
		component->SetPropertyValue("Name", place.name);
		for (const auto& [name, value] : place.properties)
			component->SetPropertyValue(name, value);
		fComponents[place.name] = component;
	}

	template <class Task>
	void Locked(Task task)
	{
		ASSERT_TRUE(fForm->Lock());
		task();
		fForm->Unlock();
	}

	/// The names of the selected components.
	std::string Selected()
	{
		std::string names;
		Locked([&] {
			for (auto& [name, component] : fComponents) {
				if (component != nullptr && component->IsDesignerSelected())
					names += name;
			}
		});
		return names;
	}

	/// Clicks beside the components, which selects the form.
	WindowPicture PictureOfNoneSelected()
	{
		fRobot.Click(kBesideTheComponents);
		EXPECT_EQ(Selected(), "");
		return fRobot.Picture();
	}

	/// In the window's coordinates, which are the form's.
	BRect FrameInWindow(const std::string& name)
	{
		BRect frame;
		Locked([&] {
			BView* view = fComponents[name]->DTView();
			frame = view->Bounds();
			view->ConvertToScreen(&frame);
			fForm->ConvertFromScreen(&frame);
		});
		return frame;
	}

	/// Generates the sources; each handler prints its name. Returns the program's path, "" when it could
	/// not be built.
	std::string Build()
	{
		{
			CapturedOutput output;
			TCodeGenerator generator;
			generator.SetAppComponent(&fApp);
			generator.GenerateApp();
		}
		const std::string source = fFolder / "Form1.cpp";
		const std::string text = ReadFile(source);
		std::ofstream(source) << "#include <cstdio>\n"
							  << std::regex_replace(text,
									 std::regex("void TForm1::([A-Za-z]+(Click|Change|Enter|Select|"
												"Invoke|Expand|Modify))(\\(.*\\))\n\\{\n"),
									 "void TForm1::$1$3\n{\n\tputs(\"$1\");fflush(stdout);\n");
		const std::string program = fFolder / "controls";
		const command_result built = RunCommand("cd " + fFolder.Path()
			+ " && " PLIM_CXX " -w -o controls *.cpp $(PKG_CONFIG_PATH=" PLIM_BUILD_DIR
			  "/pkgconfig pkg-config --cflags --libs ormi) " GENERATED_FLAGS);
		EXPECT_EQ(built.code, 0) << built.output;
		return built.code == 0 ? program : "";
	}

	command_result Run(const std::string& program, const std::string& script)
	{
		std::ofstream(fFolder / "script.robot") << script;
		return RunCommand("BE_DISPLAY=qt QT_QPA_PLATFORM=offscreen BE_ROBOT_SCRIPT="
			+ (fFolder / "script.robot") + " " + Within(100) + program);
	}

	BApplication fApplication{"application/x-vnd.plimworks-components-test"};
	TemporaryFolder fFolder;
	TAppComponent fApp;
	TDesignForm* fForm = nullptr;
	std::map<std::string, TComponent*> fComponents;
	Robot fRobot;
};


TEST_F(ControlsProgramTest, EachClassOfTheLibraryIsOnTheForm)
{
	for (int32 i = 0; i < PaletteCatalog().CountPalEntries(); i++) {
		const std::string name = PaletteCatalog().PalEntryAt(i)->ClassName();
		EXPECT_TRUE(std::any_of(std::begin(kForm), std::end(kForm), [&](const placement& place) {
			return name == place.className;
		})) << name;
	}
}


TEST_F(ControlsProgramTest, TheDesignLooksLikeTheProgram)
{
	const std::string program = Build();
	ASSERT_NE(program, "");
	const std::string file = fFolder / "program.png";
	const command_result ran = Run(program, "wait-window Form\nsave-png " + file + "\nquit\n");
	ASSERT_EQ(ran.code, 0) << ran.output;
	const std::unique_ptr<BBitmap> picture(BTranslationUtils::GetBitmapFile(file.c_str()));
	ASSERT_NE(picture, nullptr);

	// The component that was placed last is selected, and its mark would take the place of pixels.
	EXPECT_EQ(Selected(), "Icon");
	const WindowPicture design = PictureOfNoneSelected();
	if (const char* folder = getenv("KEEP_PICTURES")) {
		design.SavePng((std::string(folder) + "/design.png").c_str());
		RunCommand("cp " + file + " " + folder);
	}
	ASSERT_EQ(picture->Bounds(), BRect(0, 0, design.width - 1, design.height - 1));
	WindowPicture shown;
	shown.width = design.width;
	shown.height = design.height;
	for (int32 y = 0; y < shown.height; y++) {
		const uint32* row = reinterpret_cast<const uint32*>(
			static_cast<const uint8*>(picture->Bits()) + y * picture->BytesPerRow());
		shown.pixels.insert(shown.pixels.end(), row, row + shown.width);
	}
	for (const placement& place : kForm)
		EXPECT_TRUE(design.SameIn(shown, FrameInWindow(place.name))) << place.name;
}


TEST_F(ControlsProgramTest, TheProgramTellsOfEachEvent)
{
	Locked([&] {
		for (auto& [name, component] : fComponents) {
			// Those of every view are first.
			for (int32 i = 13; component != nullptr && i < component->CountEvents(); i++)
				component->SetEventSelection(component->EventAt(i)->name, true);
		}
	});
	const std::string program = Build();
	ASSERT_NE(program, "");
	// In places of the form, which is where the window is.
	const command_result ran = Run(program, R"(wait-window Form
click-view Push
click-view Tick
click 310 40
click 550 43
type "x"
key enter
click 50 75
click 180 180
click 290 120
click 330 90
double-click 330 108
click 459 73
click 480 90
click 255 148
wait-window *
click-item Blue
wait-window Form
click 15 10
click-item Open
wait-window Form
drag 276 201 350 201
click 500 208
click 300 270
click 60 250
type "y"
click 100 350
click 230 345
click 490 338
click 480 450
click 580 460
click-view "Beta's"
quit
)");
	EXPECT_EQ(ran.code, 0) << ran.output;
	for (const char* event : {"PushClick", "TickChange", "SecondChange", "FieldChange",
			 "FieldEnter", "CaptionClick", "FrameClick", "PlainClick", "RowsSelect", "RowsInvoke",
			 "TreeExpand", "TreeSelect", "ChoiceChange", "MenusInvoke", "RangeModify",
			 "RangeChange", "ProgressClick", "TintChange", "NotesChange", "PhotoClick", "IconClick",
			 "PagesChange", "OnBetaChange", "SpeedClick", "HourClick"})
		EXPECT_NE(("\n" + ran.output).find(std::string("\n") + event + "\n"), std::string::npos)
			<< event << " of\n"
			<< ran.output;
	EXPECT_EQ(("\n" + ran.output).find("\nFirstChange\n"), std::string::npos);
}


TEST_F(ControlsProgramTest, ControlsOnTheSurfaceDoNotAct)
{
	const auto State = [&] {
		std::string state;
		Locked([&] {
			for (auto& [name, component] : fComponents) {
				for (int32 i = 0; component != nullptr && i < component->CountProperties(); i++)
					state += std::string(component->PropertyAt(i)->Value()) + "\n";
			}
		});
		return state;
	};
	const std::string before = State();
	const WindowPicture looked = PictureOfNoneSelected();
	for (const placement& place : kForm) {
		if (fComponents[place.name]->DTView()->IsHidden())
			continue;
		// A press that selects, a wheel, keys.
		const BRect frame = FrameInWindow(place.name);
		fRobot.Click(BPoint(frame.left + 14, frame.top + 12));
		fRobot.Wheel(2);
		fRobot.Type("x");
		EXPECT_TRUE(fRobot.Key("space"));
	}
	fRobot.Settle();
	EXPECT_TRUE(State() == before);
	const WindowPicture now = PictureOfNoneSelected();
	for (const placement& place : kForm)
		EXPECT_TRUE(now.SameIn(looked, FrameInWindow(place.name))) << place.name;
}


TEST_F(ControlsProgramTest, ASelectedComponentShowsItsHandleOverWhatIsInIt)
{
	for (const placement& place : kForm) {
		if (fComponents[place.name]->DTView()->IsHidden())
			continue;
		const BRect frame = FrameInWindow(place.name);
		Locked([&] {
			fComponents[place.name]->DesignerSelect(true);
			fComponents[place.name]->DTView()->Invalidate();
		});
		fRobot.Settle();
		const BRect handle(frame.right - 5, frame.bottom - 5, frame.right, frame.bottom);
		const rgb_color kSelection = {0, 200, 200, 255};
		EXPECT_EQ(fRobot.Picture().Count(handle, kSelection), 36) << place.name;
	}
}


TEST_F(ControlsProgramTest, ADoubleClickOnATabShowsItsPage)
{
	BPoint beta;
	Locked([&] {
		const BTabView* tabs = dynamic_cast<const BTabView*>(fComponents["Pages"]->DTView());
		const BRect tab = tabs->TabFrame(1);
		beta = BPoint((tab.left + tab.right) / 2, (tab.top + tab.bottom) / 2);
	});
	fRobot.Click(FrameInWindow("Pages").LeftTop() + beta, 2);
	fRobot.Settle();
	Locked([&] {
		EXPECT_STREQ(fComponents["Pages"]->FindProperty("Selection")->Value(), "1");
		EXPECT_TRUE(fComponents["OnAlpha"]->DTView()->IsHidden());
		EXPECT_FALSE(fComponents["OnBeta"]->DTView()->IsHidden());
	});
	// A single click on the other one only selects the component.
	fRobot.Click(FrameInWindow("Pages").LeftTop() + BPoint(20, 10));
	fRobot.Settle();
	EXPECT_STREQ(fComponents["Pages"]->FindProperty("Selection")->Value(), "1");
}
