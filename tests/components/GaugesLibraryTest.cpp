// SPDX-License-Identifier: MIT
// What a component library adds to the designer, by the example of the gauges.

#include <Bitmap.h>
#include <Message.h>

#include <gauges/ClockView.h>
#include <gauges/DialView.h>

#include "designer/DesignerTest.h"
#include "designer/DocumentFile.h"
#include "model/Event.h"
#include "model/Property.h"
#include "palette/PaletteCatalog.h"
#include "palette/PaletteEntry.h"
#include "props/PropertyEditor.h"
#include "support/CapturedOutput.h"
#include "support/Printers.h"

namespace {

constexpr uint32 kShowMaximum = 'gMax';
constexpr uint32 kShowValue = 'gVal';

std::string
ParamsOf(TComponent* component)
{
	BString text;
	component->OnSetConstructorParams(text);
	return text.String();
}

} // namespace

class GaugesLibraryTest : public DesignerTest {
protected:
	TComponent* Gauge(const char* name = "Gauge1") { return Place(fForm, "TGauge", name); }
	TComponent* Clock(const char* name = "Clock1") { return Place(fForm, "TClock", name); }

	static const Gauges::DialView* Dial(TComponent* component)
	{
		return dynamic_cast<Gauges::DialView*>(component->DTView());
	}

	/// As the property window does it.
	static std::string Enter(TComponent* component, const char* name, const char* value)
	{
		CapturedOutput output;
		TProperty* property = component->FindProperty(name);
		property->Editor()->SetValue(value, true);
		return property->Value();
	}

	static void Choose(TComponent* component, uint32 command)
	{
		BMessage message(command);
		EXPECT_TRUE(component->HandleComponentContextMessage(&message));
	}

	TDesignForm* fForm = NewForm();
};


TEST_F(GaugesLibraryTest, EachClassHasItsNameHeaderPropertiesAndEvents)
{
	const struct {
		const char* className;
		const char* stem;
		const char* header;
		std::vector<const char*> properties;
		std::vector<const char*> events;
	} kCases[] = {
		{"TGauge", "Gauge", "gauges/Gauge.h",
			{"Minimum", "Maximum", "Value", "Unit", "Ticks", "NeedleColor", "Zones",
				"ResizingMode"},
			{"OnClick", "OnChange"}},
		{"TClock", "Clock", "gauges/Clock.h",
			{"Time", "Running", "Seconds", "HandColor", "ResizingMode"}, {"OnClick", "OnTick"}},
	};
	for (const auto& row : kCases) {
		const TPaletteEntry* entry = PaletteCatalog().FindPalEntry(row.className);
		ASSERT_NE(entry, nullptr) << row.className;
		EXPECT_STREQ(entry->ComponentName(), row.stem);
		EXPECT_STREQ(entry->Copyright(), "Gauges for Plimworks");
		TComponent* component = Place(fForm, row.className, row.stem);
		EXPECT_STREQ(component->ClassName(), row.className);
		EXPECT_STREQ(component->HeaderFile(), row.header);
		for (const char* name : row.properties) {
			ASSERT_NE(component->FindProperty(name), nullptr) << row.className << " " << name;
			EXPECT_NE(component->FindProperty(name)->Editor(), nullptr) << name;
		}
		EXPECT_EQ(component->CountEvents(), 13 + static_cast<int32>(row.events.size()));
		for (const char* name : row.events)
			EXPECT_NE(component->FindEvent(name), nullptr) << row.className << " " << name;
	}
}


TEST_F(GaugesLibraryTest, TheDesignFollowsTheProperties)
{
	TComponent* gauge = Gauge();
	Enter(gauge, "Minimum", "-20");
	Enter(gauge, "Maximum", "50");
	Enter(gauge, "Value", "13");
	Enter(gauge, "Unit", "C");
	EXPECT_EQ(Dial(gauge)->Minimum(), -20);
	EXPECT_EQ(Dial(gauge)->Maximum(), 50);
	EXPECT_EQ(Dial(gauge)->Value(), 13);
	EXPECT_STREQ(Dial(gauge)->Unit(), "C");

	TComponent* clock = Clock();
	Enter(clock, "Time", "23:59:58");
	const auto* view = dynamic_cast<Gauges::ClockView*>(clock->DTView());
	EXPECT_EQ(view->Time(), (Gauges::day_time{23, 59, 58}));
	EXPECT_FALSE(view->IsRunning());
}


TEST_F(GaugesLibraryTest, ValuesThatNoProgramCouldBeMadeOfAreRefused)
{
	TComponent* gauge = Gauge();
	for (const char* name : {"Minimum", "Maximum", "Value", "Ticks"}) {
		const std::string before = gauge->FindProperty(name)->Value();
		for (const char* value : {"", "ten", "1.5", "3 4", "99999999999", "0x10", "1;"})
			EXPECT_EQ(Enter(gauge, name, value), before) << name << " " << value;
		EXPECT_EQ(Enter(gauge, name, "-7"), "-7");
		EXPECT_EQ(Enter(gauge, name, "2147483647"), "2147483647");
	}
	const std::string zones = gauge->FindProperty("Zones")->Value();
	for (const char* value : {"red", "0..10", "10..0 {1,2,3,4}", "0..10 {1,2,3}",
			 "0..10 {1,2,300,4}", "0..10 {1,2,3,4} x", "0..10 {1,2,3,4}|oops"})
		EXPECT_EQ(Enter(gauge, "Zones", value), zones) << value;
	EXPECT_EQ(Enter(gauge, "Zones", "-5..5 {1,2,3,4}"), "-5..5 {1,2,3,4}");
	EXPECT_EQ(Enter(gauge, "Zones", ""), "");

	TComponent* clock = Clock();
	for (const char* value :
		{"", "noon", "24:00", "12:60", "12:00:60", "12", "12:", "12:00:", "12:00:00x", "-1:00"})
		EXPECT_EQ(Enter(clock, "Time", value), "10:10:00") << value;
}


TEST_F(GaugesLibraryTest, TheTimesEditorCompletesWhatIsTyped)
{
	TComponent* clock = Clock();
	EXPECT_EQ(Enter(clock, "Time", "7:5"), "07:05:00");
	EXPECT_EQ(Enter(clock, "Time", "23:59:1"), "23:59:01");
	EXPECT_EQ(clock->FindProperty("Time")->Editor()->EditLimit(), 8);
	EXPECT_STREQ(clock->GetPropertyValue("Time"), "23:59:01");
}


TEST_F(GaugesLibraryTest, TheZonesEditorShowsTheirNumber)
{
	TComponent* gauge = Gauge();
	const TPropertyEditor* editor = gauge->FindProperty("Zones")->Editor();
	EXPECT_EQ(editor->Type(), PET_MODAL);
	EXPECT_STREQ(editor->GetDisplayValue(), "3 zones");
	Enter(gauge, "Zones", "0..5 {1,2,3,4}");
	EXPECT_STREQ(editor->GetDisplayValue(), "1 zone");
	Enter(gauge, "Zones", "");
	EXPECT_STREQ(editor->GetDisplayValue(), "0 zones");
}


TEST_F(GaugesLibraryTest, GeneratedSourcesGetTextForTheHeaderParametersAndInitialization)
{
	TComponent* gauge = Gauge("Speed");
	Enter(gauge, "Minimum", "-10");
	Enter(gauge, "Maximum", "30");
	Enter(gauge, "Zones", "-10..0 {1,2,3,4}|0..30 {255,0,0,255}");
	EXPECT_EQ(ParamsOf(gauge), "-10,30");
	BString text;
	EXPECT_TRUE(gauge->OnGenHeaderFileTop(text));
	EXPECT_STREQ(
		text.String(), "enum { k$FORMNAMESpeedMinimum = -10, k$FORMNAMESpeedMaximum = 30 };");
	text = "";
	EXPECT_TRUE(gauge->OnGenInitForm(text));
	EXPECT_STREQ(text.String(),
		"$COMPONENT->AddZone(-10,0,make_color(1,2,3,4));\n"
		"$COMPONENT->AddZone(0,30,make_color(255,0,0,255));");
	for (const char* name : {"Minimum", "Maximum", "Zones"})
		EXPECT_FALSE(gauge->FindProperty(name)->IsGenerated()) << name;

	Enter(gauge, "Zones", "");
	text = "";
	EXPECT_FALSE(gauge->OnGenInitForm(text));
	EXPECT_TRUE(text.IsEmpty());
	EXPECT_EQ(ParamsOf(Clock()), "\"10:10:00\"");
}


TEST_F(GaugesLibraryTest, ACommandOfTheContextMenuShowsASampleAndChangesNoProperty)
{
	TComponent* gauge = Gauge();
	Enter(gauge, "Value", "30");
	gauge->SetModified(false);
	Choose(gauge, kShowMaximum);
	EXPECT_EQ(Dial(gauge)->Value(), 100);
	EXPECT_STREQ(gauge->FindProperty("Value")->Value(), "30");
	EXPECT_TRUE(gauge->Modified());
	Choose(gauge, kShowValue);
	EXPECT_EQ(Dial(gauge)->Value(), 30);

	BMessage other('othe');
	EXPECT_FALSE(gauge->HandleComponentContextMessage(&other));
}


TEST_F(GaugesLibraryTest, AFormKeepsTheSampleOfEachGaugeWhereverItStands)
{
	// The document asks one property of each component, which depends on the component's place. "Value" is in
	// turn for one of these gauges.
	const int32 count = 16;
	for (int32 i = 0; i < count; i++) {
		TComponent* gauge = Gauge(("Gauge" + std::to_string(i)).c_str());
		if (i != 3)
			Choose(gauge, kShowMaximum);
	}
	Save(fForm, fFolder / "gauges.frm");
	ASSERT_TRUE(fResult);

	TDesignForm* loaded = NewForm("Form2");
	Load(loaded, fFolder / "gauges.frm");
	ASSERT_TRUE(fResult);
	ASSERT_EQ(loaded->CountComponents(), count);
	for (int32 i = 0; i < count; i++) {
		EXPECT_EQ(Dial(loaded->ComponentAt(i))->Value(), i == 3 ? 0 : 100) << i;
		EXPECT_STREQ(loaded->ComponentAt(i)->FindProperty("Value")->Value(), "0") << i;
	}
}


TEST_F(GaugesLibraryTest, APropertyWithDataMayWriteItAgainAndAgain)
{
	TComponent* gauge = Gauge();
	const TProperty* value = gauge->FindProperty("Value");
	BMessage message;
	value->WriteExtendedData(&message);
	EXPECT_EQ(message.CountNames(B_ANY_TYPE), 0);
	for (int i = 0; i < 3; i++) {
		Choose(gauge, kShowMaximum);
		value->WriteExtendedData(&message);
	}
	type_code type;
	int32 count;
	ASSERT_EQ(message.GetInfo("gauges:sample:Value", &type, &count), B_OK);
	EXPECT_EQ(count, 1);
	EXPECT_EQ(message.GetInt32("gauges:sample:Value", 0), 100);

	// A message that has none leaves the sample alone.
	BMessage empty;
	gauge->FindProperty("Value")->ReadExtendedData(&empty);
	EXPECT_EQ(Dial(gauge)->Value(), 100);
}


TEST_F(GaugesLibraryTest, ADialWithAnEmptyOrTurnedRangeShowsItsBeginning)
{
	TComponent* gauge = Gauge();
	for (const char* maximum : {"0", "-50", "-2147483648"}) {
		Enter(gauge, "Maximum", maximum);
		Enter(gauge, "Value", "2147483647");
		EXPECT_EQ(Dial(gauge)->Value(), 2147483647) << maximum;
	}
}


TEST_F(GaugesLibraryTest, TheClockOfAProgramTellsOfASecondWhenItRuns)
{
	class TickedClock : public Gauges::ClockView {
	public:
		using ClockView::ClockView;
		int ticks = 0;

	protected:
		void TimeChanged() override { ticks++; }
	} clock(BRect(0, 0, 50, 50), "clock", "nonsense");
	EXPECT_EQ(clock.Time(), (Gauges::day_time{0, 0, 0}));
	clock.SetTime("25:00");
	EXPECT_EQ(clock.Time(), (Gauges::day_time{0, 0, 0}));
	clock.Pulse();
	EXPECT_EQ(clock.ticks, 0);

	clock.SetTime("12:00:00");
	const Gauges::day_time noon = clock.Time();
	clock.SetRunning(true);
	clock.Pulse();
	// At noon itself there is nothing to tell.
	EXPECT_EQ(clock.ticks, clock.Time() == noon ? 0 : 1);
}
