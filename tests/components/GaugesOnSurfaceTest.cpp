// SPDX-License-Identifier: MIT
// The gauges used by mouse and keyboard: their menu on the surface, their editors in the property window.

#include <ListView.h>

#include "app/WindowGuard.h"
#include "designer/SurfaceTest.h"
#include "model/Component.h"
#include "props/PropertyListItem.h"
#include "support/LatestValues.h"
#include "support/Printers.h"

class GaugesOnSurfaceTest : public SurfaceTest {
protected:
	/// What the property window shows for it.
	std::string Shown(const char* property)
	{
		WaitForLatestValues(Inspector(), fRobot);
		WindowGuard guard(Inspector());
		auto* list = dynamic_cast<BListView*>(Inspector()->FindView("lvProperties"));
		for (int32 i = 0; i < list->CountItems(); i++) {
			const auto* row = static_cast<TPropertyListItem*>(list->ItemAt(i));
			if (strcmp(row->Name(), property) == 0)
				return row->DisplayValue();
		}
		return "?";
	}

	void OpenZones()
	{
		Invoke("Zones");
		ASSERT_TRUE(fRobot.WaitForWindow("Zones"));
	}

	void EnterZones(const char* text)
	{
		fRobot.ClickView("tvZones");
		fRobot.Key("command+a");
		fRobot.Type(text);
		fRobot.ClickView("btnOK");
	}

	WindowPicture PictureOfForm()
	{
		fRobot.SetWindow(BMessenger(Form()));
		fRobot.Settle();
		return fRobot.Picture();
	}
};


TEST_F(GaugesOnSurfaceTest, TheContextMenuShowsOtherValuesAndTheFormKeepsThem)
{
	TComponent* gauge = Draw("TGauge", BRect(20, 20, 140, 140));
	ASSERT_NE(gauge, nullptr);
	const WindowPicture before = PictureOfForm();
	SetModified(false);
	ASSERT_TRUE(ChooseFromMenu(BPoint(80, 80), "Show the maximum"));
	const WindowPicture after = PictureOfForm();
	EXPECT_FALSE(after.SameIn(before, BRect(20, 20, 140, 140)));
	EXPECT_TRUE(IsModified());
	EXPECT_EQ(Value(gauge, "Value"), "0");

	Locked([this] { EXPECT_TRUE(Form()->SaveToFile((fFolder / "form.frm").c_str())); });
	EXPECT_FALSE(IsModified());
	ASSERT_TRUE(ChooseFromMenu(BPoint(80, 80), "Show the value"));
	EXPECT_TRUE(PictureOfForm().SameIn(before, BRect(20, 20, 140, 140)));
}


TEST_F(GaugesOnSurfaceTest, ZonesAreEditedInADialogThatStaysOpenUntilTheyCanBeRead)
{
	TComponent* gauge = Draw("TGauge", BRect(20, 20, 140, 140));
	ASSERT_NE(gauge, nullptr);
	const std::string zones = Value(gauge, "Zones");
	const WindowPicture before = PictureOfForm();

	EXPECT_EQ(Shown("Zones"), "3 zones");
	OpenZones();
	EXPECT_EQ(fRobot.Text("tvZones"),
		"0..60 {60,160,60,255}\n60..80 {230,170,40,255}\n80..100 {200,50,50,255}");
	EnterZones("0..50 blue");
	EXPECT_TRUE(
		fRobot.WaitForText("lblHint", "A line cannot be read. Write: 0..60 {60,160,60,255}"));
	EXPECT_EQ(Value(gauge, "Zones"), zones);
	EnterZones("0..50 {0,0,200,255}\n50..100 {0,200,200,255}");
	ASSERT_TRUE(fRobot.WaitForNoWindow("Zones"));
	EXPECT_EQ(Value(gauge, "Zones"), "0..50 {0,0,200,255}|50..100 {0,200,200,255}");
	EXPECT_EQ(Shown("Zones"), "2 zones");
	EXPECT_FALSE(PictureOfForm().SameIn(before, BRect(20, 20, 140, 140)));

	OpenZones();
	fRobot.ClickView("btnCancel");
	ASSERT_TRUE(fRobot.WaitForNoWindow("Zones"));
	EXPECT_EQ(Value(gauge, "Zones"), "0..50 {0,0,200,255}|50..100 {0,200,200,255}");
}


TEST_F(GaugesOnSurfaceTest, AClockTakesTheTimeThatIsTypedOrThePresentOne)
{
	TComponent* clock = Draw("TClock", BRect(20, 20, 140, 140));
	ASSERT_NE(clock, nullptr);
	Invoke("Time");
	fRobot.Key("command+a");
	fRobot.Type("4:30");
	fRobot.Key("enter");
	fRobot.Settle();
	EXPECT_EQ(Value(clock, "Time"), "04:30:00");
	const WindowPicture early = PictureOfForm();

	Invoke("Time");
	fRobot.Key("command+a");
	fRobot.Type("late");
	fRobot.Key("enter");
	fRobot.Settle();
	EXPECT_EQ(Value(clock, "Time"), "04:30:00");
	EXPECT_TRUE(PictureOfForm().SameIn(early, BRect(20, 20, 140, 140)));

	WorkOn(Form());
	fRobot.Click(BPoint(80, 80), 2);
	fRobot.Settle();
	EXPECT_NE(Value(clock, "Time"), "04:30:00");
	EXPECT_EQ(Value(clock, "Time").size(), 8u);
}
