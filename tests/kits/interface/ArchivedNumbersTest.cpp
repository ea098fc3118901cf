// SPDX-License-Identifier: MIT
// What becomes of numbers in archives that should stand for a value of an enumeration, but for none.
#include <climits>
#include <functional>
#include <string>

#include <Alert.h>
#include <Box.h>
#include <ChannelSlider.h>
#include <ColorControl.h>
#include <MenuBar.h>
#include <MenuField.h>
#include <Message.h>
#include <PopUpMenu.h>
#include <Slider.h>
#include <StringView.h>
#include <TabView.h>
#include <TextControl.h>
#include <TextView.h>
#include <Window.h>

#include "InterfaceFixture.h"
#include "support/Printers.h"

namespace {

struct ArchivedNumber {
	const char* of;
	std::function<BArchivable*()> make;
	const char* name;
	/// What stands in for a number that is no value.
	int32 otherwise;
};


const BRect kFrame(0, 0, 99, 99);


void
Delete(BArchivable* object)
{
	if (auto window = dynamic_cast<BWindow*>(object)) {
		window->Lock();
		window->Quit();
	} else
		delete object;
}


using ArchivedNumbersTest = InterfaceTest;

} // namespace


TEST_F(ArchivedNumbersTest, ThoseThatAreNoValueGiveWayToOneThatIs)
{
	const auto makeSlider = [] {
		return new BSlider(kFrame, "s", "", nullptr, 0, 9, B_TRIANGLE_THUMB);
	};
	const auto makeTabs = [] { return new BTabView(kFrame, "t", B_WIDTH_FROM_LABEL); };
	const auto makeText = [] { return new BTextControl(kFrame, "c", "", "", nullptr); };
	const auto makeWindow = [] { return new BWindow(kFrame, "w", B_MODAL_WINDOW, 0); };
	const ArchivedNumber kNumbers[] = {
		{"BView", [] { return new BView(kFrame, "v", 0, 0); }, "_dmod", B_OP_COPY},
		{"BWindow", makeWindow, "_wlook", B_TITLED_WINDOW_LOOK},
		{"BWindow", makeWindow, "_wfeel", B_NORMAL_WINDOW_FEEL},
		{"BAlert", [] { return new BAlert("a", "", "OK"); }, "_but_width", B_WIDTH_AS_USUAL},
		{"BBox", [] { return new BBox(kFrame, "b"); }, "_style", B_FANCY_BORDER},
		{"BSlider", makeSlider, "_hashloc", B_HASH_MARKS_NONE},
		{"BSlider", makeSlider, "_sstyle", B_BLOCK_THUMB},
		{"BSlider", makeSlider, "_orient", B_HORIZONTAL},
		{"BChannelSlider",
			[] { return new BChannelSlider(kFrame, "s", "", nullptr, B_VERTICAL, 2); }, "_orient",
			B_HORIZONTAL},
		{"BColorControl", [] { return new BColorControl(BPoint(), B_CELLS_4x64, 8, "c"); },
			"_layout", B_CELLS_32x8},
		{"BMenuBar", [] { return new BMenuBar(kFrame, "m"); }, "_border", B_BORDER_FRAME},
		{"BMenu", [] { return new BMenu("m", B_ITEMS_IN_COLUMN); }, "_layout", B_ITEMS_IN_ROW},
		{"BMenuField", [] { return new BMenuField(kFrame, "f", "", new BPopUpMenu("")); }, "_align",
			B_ALIGN_LEFT},
		{"BTextControl", makeText, "_a_label", B_ALIGN_LEFT},
		{"BTextControl", makeText, "_a_text", B_ALIGN_LEFT},
		{"BTextView", [] { return new BTextView(kFrame, "t", kFrame, 0, 0); }, "_align",
			B_ALIGN_LEFT},
		{"BStringView", [] { return new BStringView(kFrame, "s", ""); }, "_align", B_ALIGN_LEFT},
		{"BTabView", makeTabs, "_but_width", B_WIDTH_AS_USUAL},
		{"BTabView", makeTabs, "_border_style", B_FANCY_BORDER},
		{"BTabView", makeTabs, "_TabSide", BTabView::kTopSide},
	};
	for (const ArchivedNumber& each : kNumbers) {
		BMessage archive;
		BArchivable* original = each.make();
		EXPECT_EQ(original->Archive(&archive, false), B_OK);
		Delete(original);
		const bool isShort = archive.HasInt16(each.name);
		// The middle ones fit into the bits of the values, the others do not.
		for (int32 number :
			{INT_MIN, SHRT_MIN, -3, 63, 127, static_cast<int>(SHRT_MAX), 0x77000001}) {
			SCOPED_TRACE(std::string(each.of) + "'s " + each.name + " " + std::to_string(number));
			if (isShort)
				archive.SetInt16(each.name, static_cast<int16>(number | 64));
			else
				archive.SetInt32(each.name, number);
			BArchivable* made = instantiate_object(&archive);
			ASSERT_NE(made, nullptr);
			BMessage again;
			EXPECT_EQ(made->Archive(&again, false), B_OK);
			// Some leave out what is as it is anyway.
			EXPECT_EQ(isShort ? again.GetInt16(each.name, static_cast<int16>(each.otherwise))
							  : again.GetInt32(each.name, each.otherwise),
				each.otherwise);
			Delete(made);
		}
	}
}
