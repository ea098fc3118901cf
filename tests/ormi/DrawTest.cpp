// SPDX-License-Identifier: MIT
// Tests of the draw events, with a display that draws.

#include <ormi/Form.h>

#include "EventFormFixture.h"

class DrawTest : public EventFormTest {};


TEST_F(DrawTest, TheFormAndEachComponentAreDrawnWhenTheFormIsShown)
{
	gEvents.Take();
	fForm->Show();
	Lines events;
	auto isDrawn = [&] {
		for (const std::string& line : gEvents.Take())
			events.push_back(line);
		return Count(events, "Draw") > 0 && Count(events, "Button2Draw") > 0;
	};
	const bigtime_t end = system_time() + 10000000;
	while (!isDrawn() && system_time() < end)
		snooze(5000);
	for (const char* line : {"Draw", "Button1Draw", "CheckBox1Draw", "TextControl1Draw",
			 "StringView1Draw", "Box1Draw", "Button2Draw"})
		EXPECT_GE(Count(events, line), 1) << line;
}


TEST_F(DrawTest, AnInvalidatedComponentIsDrawnAgain)
{
	fForm->Show();
	Settle(fForm);
	gEvents.Take();
	Locked([&] { fForm->StringView1->Invalidate(); });
	Settle(fForm);
	EXPECT_GE(Count(gEvents.Take(), "StringView1Draw"), 1);
}
