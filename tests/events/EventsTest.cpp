// SPDX-License-Identifier: MIT
// A generated program with every component class and every event, used like a person uses it: each event calls its
// handler, with what it is about, in the order that the platform has.

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <iterator>
#include <map>
#include <memory>
#include <set>
#include <sstream>
#include <thread>

#include <gtest/gtest.h>

#include "ProgramRun.h"
#include "support/Printers.h"

namespace {

// Beside the components.
const BPoint kBare(5, 25);
// How much larger it is made.
const BPoint kMore(11, 31);

std::string
At(BPoint point)
{
	std::ostringstream text;
	text << point.x << " " << point.y;
	return text.str();
}


std::string
WithComma(float x, float y)
{
	std::ostringstream text;
	text << x << "," << y;
	return text.str();
}


/// Where to press a component: its middle, unless the mouse does more there than the test wants.
BPoint
Spot(const listed_event& component)
{
	const BRect& frame = component.frame;
	if (component.className == "TMenuBar")
		return BPoint(frame.right - 9, frame.top + 9);
	return BPoint((frame.left + frame.right + 1) / 2, (frame.top + frame.bottom + 1) / 2);
}


/// On the screen.
BRect
FormFrame()
{
	for (const listed_event& event : ListedEvents()) {
		if (event.owner == "Main" && event.component.empty())
			return event.frame;
	}
	return BRect();
}


/// Whether a press on it opens a menu.
bool
OpensMenu(const listed_event& component)
{
	return component.className == "TMenuField";
}


/// The components of the main form, each by its first event.
std::vector<listed_event>
Components()
{
	std::vector<listed_event> components;
	for (const listed_event& event : ListedEvents()) {
		const bool isKnown = !components.empty() && components.back().component == event.component;
		if (event.owner == "Main" && !event.component.empty() && !isKnown)
			components.push_back(event);
	}
	return components;
}


listed_event
Component(const std::string& name)
{
	for (const listed_event& component : Components()) {
		if (component.component == name)
			return component;
	}
	return {};
}


bool
Has(const Lines& calls, const std::string& call)
{
	return std::find(calls.begin(), calls.end(), call) != calls.end();
}


/// Which of \a calls is \a call; a failure and -1 when none is.
int
Index(const Lines& calls, const std::string& call)
{
	const auto found = std::find(calls.begin(), calls.end(), call);
	if (found == calls.end()) {
		ADD_FAILURE() << call << " was not called";
		return -1;
	}
	return static_cast<int>(found - calls.begin());
}


std::string
Text(const Lines& calls)
{
	std::string text;
	for (const std::string& call : calls)
		text += "  " + call + "\n";
	return text;
}


/// All that a user can do to the main form, in steps.
class WholeRun : public ProgramRun {
public:
	explicit WholeRun(const std::string& dialect)
		: ProgramRun(dialect)
	{
		Do("wait-window Main");
		Step("open");
		UseForm();
		UseMouse();
		UseComponents();
		UseKeys();
		UseMenus();
		UseBorder();
		UseOtherForms();
		Step("close");
		Do("wait-window Main");
		Do("close-window");
	}

private:
	void UseForm()
	{
		Step("keys of the form");
		Do("type \"x\"");
		Step("mouse on the form");
		Do("click " + At(kBare));
	}

	void UseMouse()
	{
		for (const listed_event& component : Components()) {
			Do("move " + At(kBare));
			Step("mouse on " + component.component);
			Do("click " + At(Spot(component)));
			if (!OpensMenu(component))
				continue;
			// The menu takes the release of the press that opened it.
			Do("key escape");
			Step("release on " + component.component);
			Do("drag " + At(kBare) + " " + At(Spot(component)));
		}
	}

	void UseComponents()
	{
		Step("components");
		Do("click-view TextControl1");
		Do("type \"x\"");
		Do("key enter");
		Do("double-click 440 132");
		Do("double-click 600 132");
		Do("click 559 134");
		Do("click-view MenuField1");
		Do("wait-window *");
		Do("click-item Blue");
		Do("wait-window Main");
		Do("drag-view Slider1 30 0");
		Do("click-view ColorControl1");
		Do("click-view TextView1");
		Do("type \"y\"");
		Do("click 360 325");
		Step("drag");
		// Its handler of the press drags something.
		Do("drag " + At(Spot(Component("PictureView1"))) + " " + At(Spot(Component("Button1"))));
	}

	void UseKeys()
	{
		Step("keys");
		// A text takes the tab for itself: the others are reached from behind it.
		Do("click-view ListView1");
		Do("key shift+tab");
		for (size_t i = 0; i < 2 * Components().size(); i++)
			Do("key tab");
	}

	void UseMenus()
	{
		Step("menus");
		for (const char* item : {"Hide and show", "Draw at once", "Elsewhere", "Post"}) {
			Do("click-item Window");
			Do(std::string("click-item \"") + item + "\"");
			Do("wait-window Main");
		}
		for (const char* item : {"About", "Another screen", "Another workspace"}) {
			Do("click-item System");
			Do(std::string("click-item \"") + item + "\"");
			Do("wait-window Main");
		}
	}

	void UseBorder()
	{
		Step("border");
		Do("move-window 120 90");
		const BPoint size(FormFrame().Width(), FormFrame().Height());
		Do("resize-window " + At(size + kMore));
		Step("resized back");
		Do("resize-window " + At(size));
		Step("minimized");
		Do("minimize-window");
		Do("restore-window");
		Step("zoomed");
		Do("zoom-window");
		Do("zoom-window");
	}

	void UseOtherForms()
	{
		Step("another form");
		Do("click-item Forms");
		Do("click-item \"New note\"");
		Do("wait-window \"Note 1\"");
		Do("click-view Keep");
		Do("type \"n\"");
		Do("click-view Text");
		Do("type \"n\"");
		Step("kept");
		Do("click-view Close");
		Do("click-view Keep");
		Step("closed");
		Do("click-view Close");
		Do("wait-no-window \"Note 1\"");
		Do("wait-window Main");
		Do("click-item Forms");
		Do("click-item \"New note\"");
		Do("wait-window \"Note 2\"");
		Step("vanished");
		Do("click-view Vanish");
		Do("wait-no-window \"Note 2\"");
	}
};

} // namespace

class EventsTest : public testing::TestWithParam<const char*> {
protected:
	/// The programs mostly wait for the robot, so both run at once.
	static void SetUpTestSuite()
	{
		std::vector<std::thread> threads;
		for (const char* dialect : kDialects) {
			sRuns[dialect] = std::make_unique<WholeRun>(dialect);
			threads.emplace_back([run = sRuns[dialect].get()] { run->Run("", "word"); });
		}
		for (std::thread& thread : threads)
			thread.join();
		for (const auto& [dialect, run] : sRuns) {
			if (run->Code() != 0 || getenv("SHOW_EVENTS") != nullptr)
				printf("%s:\n%s", dialect.c_str(), run->Output().c_str());
		}
	}

	static void TearDownTestSuite() { sRuns.clear(); }

	void SetUp() override { ASSERT_EQ(Run().Code(), 0) << "what the program told is above"; }

	const WholeRun& Run() const { return *sRuns[GetParam()]; }

	static constexpr const char* kDialects[] = {"classic", "standard"};
	static std::map<std::string, std::unique_ptr<WholeRun>> sRuns;
};

std::map<std::string, std::unique_ptr<WholeRun>> EventsTest::sRuns;

INSTANTIATE_TEST_SUITE_P(, EventsTest, testing::Values("classic", "standard"),
	[](const testing::TestParamInfo<const char*>& info) { return std::string(info.param); });


TEST_P(EventsTest, EachEventOfEachClassCallsItsHandler)
{
	ProgramRun files(GetParam());
	files.Do("wait-window Main");
	files.Do("close-window");
	files.Run("BE_ARGUMENTS_ARE_FILES=1", EVENTS_LIST);
	ASSERT_EQ(files.Code(), 0) << files.Output();
	EXPECT_TRUE(Has(files.AllCalls(), "Events.OnRefsReceived _RRC,events.tsv"));

	std::set<std::string> called;
	for (const Lines& calls : {Run().AllCalls(), files.AllCalls()}) {
		for (const std::string& call : calls) {
			std::string name = call.substr(0, call.find(' '));
			// "Note 1.Keep.OnChange"
			if (name == "Note")
				name +=
					call.substr(call.find('.'), call.find(' ', call.find('.')) - call.find('.'));
			called.insert(name);
		}
	}
	const std::vector<listed_event> events = ListedEvents();
	EXPECT_GT(events.size(), 13u * Components().size());
	for (const listed_event& event : events)
		EXPECT_EQ(called.count(event.FullName()), 1u)
			<< event.className << ": " << event.FullName();
}


TEST_P(EventsTest, HandlersRunWithTheirLooperLocked)
{
	for (const std::string& call : Run().AllCalls())
		EXPECT_EQ(call.find("(not locked)"), std::string::npos) << call;
}


TEST_P(EventsTest, AttachingGoesFromTheFormInwardsAndBack)
{
	Lines expected = {"Main.FormCreate", "Main.OnShow", "Main.OnAttachedToWindow"};
	for (const listed_event& component : Components()) {
		expected.push_back("Main." + component.component + ".OnAttachedToWindow");
		expected.push_back("Main." + component.component + ".OnAllAttached");
	}
	expected.push_back("Main.OnAllAttached");
	expected.push_back("Main.OnGotFocus");
	Lines calls = Run().AllCalls();
	ASSERT_GE(calls.size(), expected.size());
	calls.resize(expected.size());
	EXPECT_EQ(calls, expected);
}


TEST_P(EventsTest, OpeningTellsOfNoFrames)
{
	for (const char* step : {"", "open"}) {
		for (const std::string& call : Run().Calls(step))
			EXPECT_EQ(call.find(".OnFrame"), std::string::npos) << call;
	}
}


TEST_P(EventsTest, ClosingAsksQuitsDetachesAndDestroys)
{
	Lines expected = {"Main.OnQuitRequested", "Main.OnQuit"};
	for (const listed_event& component : Components())
		expected.push_back("Main." + component.component + ".OnAllDetached");
	expected.insert(expected.end(),
		{"Main.OnAllDetached", "Main.OnHide", "Main.FormDestroy", "Events.OnQuitRequested"});
	Lines calls;
	for (const std::string& call : Run().Calls("close")) {
		// The application's own events come in another thread, and the display may want a picture.
		const bool isOther = call.find("Events.OnAppActivated") == 0
			|| call.find("Events.OnPulse") == 0 || call.find(".OnDraw") != std::string::npos;
		if (!isOther)
			calls.push_back(call);
	}
	EXPECT_EQ(calls, expected);
}


TEST_P(EventsTest, TheApplicationsEventsComeInOrder)
{
	const Lines calls = Run().AllCalls();
	EXPECT_LT(Index(calls, "Events.OnArgvReceived 2 word"), Index(calls, "Events.OnReadyToRun"));
	EXPECT_LT(Index(calls, "Events.OnReadyToRun"), Index(calls, "Events.OnPulse"));
	EXPECT_TRUE(Has(calls, "Events.OnAppActivated 1"));
	EXPECT_EQ(Run().Calls("menus", "Events.OnAboutRequested").size(), 1u);
}


TEST_P(EventsTest, PointsAreInTheComponentsCoordinates)
{
	for (const listed_event& component : Components()) {
		const std::string name = "Main." + component.component + ".";
		const std::string step = "mouse on " + component.component;
		const BPoint spot = Spot(component) - component.frame.LeftTop();
		const std::string where = WithComma(spot.x, spot.y);
		const Lines calls = Run().Calls(step);
		const Lines moves = Run().Calls(step, name + "OnMouseMoved");
		ASSERT_FALSE(moves.empty()) << component.className;
		EXPECT_EQ(moves.front(), name + "OnMouseMoved " + where + " 0 none");
		EXPECT_EQ(Run().Calls(step, name + "OnMouseDown"), Lines{name + "OnMouseDown " + where});
		EXPECT_EQ(Run().Calls(OpensMenu(component) ? "release on " + component.component : step,
					  name + "OnMouseUp"),
			Lines{name + "OnMouseUp " + where});
		EXPECT_LT(Index(calls, moves.front()), Index(calls, name + "OnMouseDown " + where));
		// Nobody else hears of it.
		for (const std::string& call : calls) {
			const bool isClick = call.find(".OnMouseDown") != std::string::npos
				|| call.find(".OnMouseUp") != std::string::npos;
			EXPECT_TRUE(!isClick || call.find(name) == 0) << step << ": " << call;
		}
	}
	EXPECT_EQ(Run().Calls("mouse on the form", "Main.OnMouseDown"), Lines{"Main.OnMouseDown 5,25"});
	EXPECT_EQ(Run().Calls("mouse on the form", "Main.OnMouseUp"), Lines{"Main.OnMouseUp 5,25"});
}


TEST_P(EventsTest, AClickIsOneClickAndNothingElseOfTheComponent)
{
	const struct {
		const char* component;
		const char* event;
	} kClicks[] = {
		{"Button1", "OnClick"},
		{"CheckBox1", "OnChange"},
		{"RadioButton1", "OnChange"},
		{"StringView1", "OnClick"},
		{"Box1", "OnClick"},
		{"View1", "OnClick"},
		{"StatusBar1", "OnClick"},
		{"PictureView1", "OnClick"},
		{"PictureButton1", "OnClick"},
		{"ListView1", "OnSelect"},
	};
	for (const auto& click : kClicks) {
		const std::string name = std::string("Main.") + click.component + ".";
		const std::string step = std::string("mouse on ") + click.component;
		EXPECT_EQ(Run().Calls(step, name + click.event), Lines{name + click.event});
	}
}


TEST_P(EventsTest, TheFormsOwnKeysAreThoseThatNoComponentGets)
{
	EXPECT_EQ(Run().Calls("keys of the form", "Main."), (Lines{"Main.OnKeyDown", "Main.OnKeyUp"}));
}


TEST_P(EventsTest, OneAtATimeHasTheFocusAndIsToldOfGainAndLoss)
{
	std::string focused;
	for (const std::string& call : Run().AllCalls()) {
		const size_t event = call.rfind('.');
		if (call.find("Main.") == 0 && call.substr(event) == ".OnGotFocus") {
			EXPECT_EQ(focused, "") << call;
			focused = call.substr(0, event);
		} else if (call.find("Main.") == 0 && call.substr(event) == ".OnLostFocus") {
			EXPECT_EQ(focused, call.substr(0, event));
			focused = "";
		}
	}
}


TEST_P(EventsTest, TheBorderMovesAndSizesTheFormAndWhatFollowsIt)
{
	EXPECT_EQ(Run().Calls("border", "Main.OnFrameMoved"), Lines{"Main.OnFrameMoved 120,90"});
	const BPoint size = BPoint(FormFrame().Width(), FormFrame().Height()) + kMore;
	EXPECT_EQ(
		Run().Calls("border", "Main.OnFrameResized"), Lines{"Main.OnFrameResized " + At(size)});
	for (const listed_event& component : Components()) {
		const std::string name = "Main." + component.component + ".";
		const BRect& frame = component.frame;
		EXPECT_EQ(Run().Calls("border", name + "OnFrameMoved"),
			Lines{name + "OnFrameMoved " + WithComma(frame.left, frame.top + kMore.y)});
		std::ostringstream size;
		size << " " << frame.Width() + kMore.x << " " << frame.Height();
		EXPECT_EQ(Run().Calls("border", name + "OnFrameResized"),
			Lines{name + "OnFrameResized" + size.str()});
	}
}


TEST_P(EventsTest, TheButtonsOfTheBorderTellWhatTheyDid)
{
	EXPECT_EQ(Run().Calls("minimized", "Main.OnMinimize"),
		(Lines{"Main.OnMinimize 1", "Main.OnMinimize 0"}));
	const Lines zooms = Run().Calls("zoomed", "Main.OnZoom");
	ASSERT_EQ(zooms.size(), 2u) << Text(Run().Calls("zoomed"));
	EXPECT_EQ(
		zooms[1], "Main.OnZoom 120,90 " + At(BPoint(FormFrame().Width(), FormFrame().Height())));
}


TEST_P(EventsTest, ArgumentsTellWhatHappened)
{
	const Lines menus = Run().Calls("menus");
	for (const char* call : {"Main.MenuBar1.OnInvoke Hide and show", "Main.OnHide", "Main.OnShow",
			 "Main.OnOpenViewTransaction", "Main.OnCommitViewTransaction",
			 "Main.OnWorkspacesChanged 1 2", "Main.OnScreenChanged 0,0,1279,1023 8",
			 "Main.OnWorkspaceActivated 3 1"})
		EXPECT_TRUE(Has(menus, call)) << call << " of\n" << Text(menus);
	EXPECT_LT(Index(menus, "Main.OnMenusBeginning"), Index(menus, "Main.OnMenusEnded"));
	const Lines components = Run().Calls("components");
	for (const char* call : {"Main.OutlineListView1.OnExpand Fruit 0", "Main.MenuField1.OnChange",
			 "Main.Slider1.OnModify", "Main.Slider1.OnChange"})
		EXPECT_TRUE(Has(components, call)) << call << " of\n" << Text(components);
}


TEST_P(EventsTest, ADragIsToldWithItsMessage)
{
	const Lines moves = Run().Calls("drag", "Main.Button1.OnMouseMoved");
	ASSERT_FALSE(moves.empty());
	EXPECT_EQ(moves[0].substr(moves[0].size() - 5), " drag") << moves[0];
}


TEST_P(EventsTest, AFormThatRefusesToQuitStaysAndMayBeClosedLater)
{
	EXPECT_EQ(Run().Calls("kept", "Note 1.OnQuitRequested").size(), 1u);
	EXPECT_EQ(Run().Calls("kept", "Note 1.FormDestroy"), Lines());
	EXPECT_EQ(Run().Calls("closed", "Note 1.FormDestroy").size(), 1u);
	EXPECT_EQ(Run().Calls("closed", "Events.OnQuitRequested"), Lines());
	EXPECT_EQ(Run().Calls("closed", "Note 2.FormDestroy"), Lines());
}


TEST_P(EventsTest, AFormMayQuitInAHandlerOfItsComponent)
{
	const Lines calls = Run().Calls("vanished", "Note 2.");
	ASSERT_EQ(calls.size(), 2u) << Text(calls);
	EXPECT_EQ(calls[0], "Note 2.Vanish.OnClick");
	EXPECT_EQ(calls[1], "Note 2.FormDestroy");
}


TEST(SeveralFormsTest, EachInstanceCallsItsOwnHandlers)
{
	ProgramRun run("standard");
	run.Do("wait-window Main");
	for (const char* note : {"\"Note 1\"", "\"Note 2\""}) {
		run.Do("wait-window Main");
		run.Do("click 5 25");
		run.Do("click-item Forms");
		run.Do("click-item \"New note\"");
		run.Do(std::string("wait-window ") + note);
		// They lie over each other otherwise.
		run.Do(std::string("move-window 300 ") + (note[6] == '1' ? "500" : "650"));
	}
	for (const char* number : {"1", "2", "1"}) {
		run.Step(std::string("typed into ") + number);
		run.Do(std::string("wait-window \"Note ") + number + "\"");
		run.Do("click 195 115");
		run.Do("click-view Text");
		run.Do(std::string("type ") + number);
	}
	run.Step("main form closed");
	run.Do("click-view Keep");
	run.Do("wait-window Main");
	run.Do("close-window");
	run.Do("wait-no-window Main");
	for (const char* number : {"2", "1"}) {
		run.Step(std::string("closed ") + number);
		run.Do(std::string("wait-window \"Note ") + number + "\"");
		if (*number == '1')
			run.Do("click-view Keep");
		run.Do("close-window");
	}
	run.Run();
	ASSERT_EQ(run.Code(), 0) << run.Output();
	EXPECT_EQ(run.Calls("typed into 1", "Note 1.Text.OnChange"),
		(Lines{"Note 1.Text.OnChange 1", "Note 1.Text.OnChange 11"}));
	EXPECT_EQ(run.Calls("typed into 2", "Note 2.Text.OnChange"), Lines{"Note 2.Text.OnChange 2"});
	EXPECT_EQ(run.Calls("typed into 1", "Note 2."), Lines());
	EXPECT_EQ(run.Calls("typed into 2", "Note 1."), Lines());
	// The form that refused keeps the program alive, and its end is the program's.
	EXPECT_EQ(run.Calls("main form closed", "Note 1.OnQuitRequested").size(), 1u);
	EXPECT_EQ(run.Calls("closed 2", "Events.OnQuitRequested"), Lines());
	EXPECT_EQ(run.Calls("closed 1", "Events.OnQuitRequested").size(), 1u);
}


TEST(EventsManualTest, TheManualNamesEachClassAndEvent)
{
	std::ifstream file(PLIM_SOURCE_DIR "/docs/ormi.md");
	const std::string manual(std::istreambuf_iterator<char>(file), {});
	for (const listed_event& event : ListedEvents()) {
		EXPECT_NE(manual.find("`" + event.name + "`"), std::string::npos) << event.name;
		const bool isForm = event.component.empty();
		EXPECT_TRUE(isForm || manual.find("`" + event.className + "`") != std::string::npos)
			<< event.className;
	}
}
