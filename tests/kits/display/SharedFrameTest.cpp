// SPDX-License-Identifier: MIT
// How a program, its display and a slow host come to agree upon a frame.
#include "display/SharedFrame.h"

#include <algorithm>
#include <deque>
#include <optional>
#include <random>
#include <vector>

#include <gtest/gtest.h>

#include <AppDefs.h>
#include <Message.h>

#include "display/InputHub.h"
#include "support/Printers.h"

using BPrivate::SharedFrame;

namespace {

// Host windows do not get above this.
const float kPanelBottom = 20;


// A program's window, the display and a host, each of which gets to its work only when a test says so.
class Talk : public BPrivate::HostWindowClient {
public:
	explicit Talk(BRect frame)
		: programHas(frame),
		  hostHas(frame),
		  fHub(true),
		  fShared(frame),
		  fGeometry(frame),
		  fLastReport(frame)
	{
		fStacked.client = this;
		fStacked.frame = frame;
		fHub.AddWindow(&fStacked);
	}

	~Talk() override { fHub.RemoveWindow(&fStacked); }

	void Deliver(std::unique_ptr<BMessage> message) override { fMessages.push_back(*message); }
	void Dropped(std::unique_ptr<BMessage>, BPoint, BPoint) override {}
	void NeedsRedraw() override {}

	// The program, as BWindow does it: it asks and waits for the display only.

	void MoveTo(BPoint leftTop)
	{
		programHas.OffsetTo(leftTop);
		fMovesAsked++;
		fShared.MoveTo(leftTop);
		Ask();
	}

	void ResizeTo(BSize size)
	{
		programHas = BRect(programHas.LeftTop(), size);
		fSizesAsked++;
		fShared.ResizeTo(size);
		Ask();
	}

	bool ProgramReads()
	{
		if (fMessages.empty())
			return false;
		const BMessage message = fMessages.front();
		fMessages.pop_front();
		const bool isMove = message.what == B_WINDOW_MOVED;
		if (message.GetInt32(BPrivate::kTimesAsked, -1) != (isMove ? fMovesAsked : fSizesAsked))
			return true;
		BRect frame = programHas;
		if (isMove)
			frame.OffsetTo(message.GetPoint("where", BPoint()));
		else
			frame = BRect(frame.LeftTop(),
				BSize(message.GetInt32("width", -1), message.GetInt32("height", -1)));
		EXPECT_NE(frame, programHas) << "told of what is known";
		programHas = frame;
		told.push_back(frame);
		return true;
	}

	// The host: what it is asked and what the user does are handled in turn.

	void UserPlaces(BRect frame)
	{
		hostHas = frame;
		Report();
	}

	/// Window managers do so more than once when a window appears.
	void Report() { fReports.push_back(hostHas); }

	bool HostWorks()
	{
		if (fRequests.empty())
			return false;
		if (fRequests.front()) {
			hostHas = *fRequests.front();
			hostHas.OffsetTo(hostHas.left, std::max(hostHas.top, kPanelBottom));
			Report();
		} else
			fReports.push_back(std::nullopt);
		fRequests.pop_front();
		return true;
	}

	// The display: a toolkit's geometry is what was asked for until a report comes, and only changes are told.

	bool DisplayHears()
	{
		if (fReports.empty())
			return false;
		const std::optional<BRect> report = fReports.front();
		fReports.pop_front();
		const BRect before = fShared.Known();
		bool asksAgain = false;
		if (!report)
			asksAgain = fShared.EndAsking(fGeometry);
		else {
			fGeometry = *report;
			if (fGeometry != fLastReport)
				fShared.HostHas(fGeometry);
			fLastReport = fGeometry;
		}
		BPrivate::TellFrame(fHub, &fStacked, fShared, before);
		if (asksAgain)
			Ask();
		return true;
	}

	/// Until nobody has anything to do.
	void Finish()
	{
		while (HostWorks() || DisplayHears() || ProgramReads()) {
		}
	}

	BRect programHas;
	BRect hostHas;
	std::vector<BRect> told;

private:
	void Ask()
	{
		fHub.SetFrame(&fStacked, fShared.Known());
		if (fShared.IsAsking())
			return;
		if (fShared.Known() != fGeometry) {
			fGeometry = fShared.Known();
			fRequests.push_back(fGeometry);
		}
		fRequests.push_back(std::nullopt);
		fShared.BeginAsking();
	}

	BPrivate::InputHub fHub;
	BPrivate::StackedWindow fStacked;
	SharedFrame fShared;
	BRect fGeometry;
	BRect fLastReport;
	int32 fMovesAsked = 0;
	int32 fSizesAsked = 0;
	/// No frame: the question whether all before it is done.
	std::deque<std::optional<BRect>> fRequests;
	std::deque<std::optional<BRect>> fReports;
	std::deque<BMessage> fMessages;
};

const BRect kStart(100, 100, 199, 149);
const BRect kElsewhere(300, 250, 399, 299);

} // namespace


TEST(SharedFrameTest, WhatIsAskedForIsNotTold)
{
	Talk talk(kStart);
	talk.MoveTo(BPoint(30, 40));
	talk.ResizeTo(BSize(9, 9));
	talk.Finish();
	EXPECT_EQ(talk.hostHas, BRect(30, 40, 39, 49));
	EXPECT_EQ(talk.programHas, talk.hostHas);
	EXPECT_TRUE(talk.told.empty());
}


TEST(SharedFrameTest, WhatTheUserDoesIsToldOnce)
{
	Talk talk(kStart);
	talk.UserPlaces(kElsewhere);
	talk.Report();
	talk.Finish();
	EXPECT_EQ(talk.told, std::vector<BRect>{kElsewhere});
}


TEST(SharedFrameTest, WordOfTheFirstFrameDoesNotUndoRequests)
{
	Talk talk(kStart);
	talk.MoveTo(kElsewhere.LeftTop());
	talk.ResizeTo(BSize(199, 199));
	// It is shown first, and what is asked for comes later.
	talk.Report();
	talk.Report();
	talk.DisplayHears();
	talk.DisplayHears();
	EXPECT_FALSE(talk.ProgramReads());
	talk.Finish();
	EXPECT_EQ(talk.hostHas, BRect(300, 250, 499, 449));
	EXPECT_EQ(talk.programHas, talk.hostHas);
	EXPECT_TRUE(talk.told.empty());
}


TEST(SharedFrameTest, APlaceThatTheManagerChoseDoesNotUndoRequests)
{
	Talk talk(kStart);
	talk.MoveTo(BPoint(10, 30));
	talk.UserPlaces(kElsewhere);
	talk.DisplayHears();
	EXPECT_FALSE(talk.ProgramReads());
	talk.Finish();
	EXPECT_EQ(talk.hostHas, kStart.OffsetToCopy(10, 30));
	EXPECT_EQ(talk.programHas, talk.hostHas);
}


TEST(SharedFrameTest, AReportThatARequestMetOnItsWayIsLeftOut)
{
	Talk talk(kStart);
	talk.UserPlaces(kElsewhere);
	talk.DisplayHears();
	talk.MoveTo(BPoint(10, 30));
	talk.ProgramReads();
	EXPECT_EQ(talk.programHas.LeftTop(), BPoint(10, 30));
	talk.Finish();
	EXPECT_EQ(talk.programHas, talk.hostHas);
	EXPECT_TRUE(talk.told.empty());
}


TEST(SharedFrameTest, TheUsersMoveOutlivesASizeOfTheProgram)
{
	for (const bool isHeardFirst : {false, true}) {
		Talk talk(kStart);
		talk.UserPlaces(kElsewhere);
		if (isHeardFirst)
			talk.DisplayHears();
		else {
			// In the midst of another request.
			talk.ResizeTo(BSize(59, 59));
			talk.HostWorks();
			talk.UserPlaces(BRect(kElsewhere.LeftTop(), BSize(59, 59)));
		}
		talk.ResizeTo(BSize(19, 19));
		talk.Finish();
		EXPECT_EQ(talk.hostHas, BRect(kElsewhere.LeftTop(), BSize(19, 19))) << isHeardFirst;
		EXPECT_EQ(talk.programHas, talk.hostHas) << isHeardFirst;
		EXPECT_EQ(talk.told.size(), 1u) << isHeardFirst;
	}
}


TEST(SharedFrameTest, TheUsersMoveAfterARequestCounts)
{
	Talk talk(kStart);
	talk.MoveTo(BPoint(10, 30));
	talk.HostWorks();
	talk.UserPlaces(kElsewhere);
	talk.Finish();
	EXPECT_EQ(talk.hostHas, kElsewhere);
	EXPECT_EQ(talk.told, std::vector<BRect>{kElsewhere});
}


TEST(SharedFrameTest, WhatTheHostRefusesIsTold)
{
	Talk talk(kStart);
	talk.MoveTo(BPoint(100, 5));
	talk.Finish();
	EXPECT_EQ(talk.told, std::vector<BRect>{kStart.OffsetToCopy(100, kPanelBottom)});

	// The host stays where it is, which the toolkit does not tell.
	talk.MoveTo(BPoint(100, 6));
	talk.Finish();
	EXPECT_EQ(talk.programHas, talk.hostHas);
	EXPECT_EQ(talk.told.size(), 2u);
}


TEST(SharedFrameTest, AskingForAnOldFrameAgainBringsItBack)
{
	Talk talk(kStart);
	talk.MoveTo(BPoint(10, 30));
	talk.MoveTo(BPoint(20, 30));
	// Just now the toolkit has heard of the first one.
	talk.HostWorks();
	talk.DisplayHears();
	talk.MoveTo(BPoint(10, 30));
	talk.Finish();
	EXPECT_EQ(talk.hostHas.LeftTop(), BPoint(10, 30));
	EXPECT_EQ(talk.programHas, talk.hostHas);
	EXPECT_TRUE(talk.told.empty());
}


// Steps of all three in any order. Those of the program are asked for by the first number, of the user by the second.
static void
TalkAtRandom(Talk& talk, std::minstd_rand& random, int requests, int placements)
{
	const auto some = [&random](int count) { return static_cast<int>(random() % count); };
	while (requests + placements > 0) {
		const BPoint leftTop(10 * some(5), 20 + 10 * some(5));
		const BSize size(10 * some(5), 10 * some(5));
		switch (some(7)) {
			case 0:
				if (requests-- > 0)
					talk.MoveTo(leftTop);
				break;
			case 1:
				if (requests-- > 0)
					talk.ResizeTo(size);
				break;
			case 2:
				if (placements-- > 0)
					talk.UserPlaces(BRect(leftTop, size));
				break;
			case 3:
				talk.Report();
				break;
			case 4:
				talk.HostWorks();
				break;
			case 5:
				talk.DisplayHears();
				break;
			default:
				talk.ProgramReads();
				break;
		}
		requests = std::max(requests, 0);
		placements = std::max(placements, 0);
	}
	talk.Finish();
}


TEST(SharedFrameTest, InTheEndProgramAndHostAgree)
{
	for (unsigned seed = 1; seed <= 1000; seed++) {
		std::minstd_rand random(seed);
		Talk talk(kStart);
		TalkAtRandom(talk, random, 6, 4);
		ASSERT_EQ(talk.programHas, talk.hostHas) << "seed " << seed;
	}
}


TEST(SharedFrameTest, AProgramThatIsLeftAloneGetsWhatItAskedForLast)
{
	for (unsigned seed = 1; seed <= 1000; seed++) {
		std::minstd_rand random(seed);
		Talk talk(kStart);
		TalkAtRandom(talk, random, 8, 0);
		ASSERT_TRUE(talk.told.empty()) << "seed " << seed;
		ASSERT_EQ(talk.programHas, talk.hostHas) << "seed " << seed;
	}
}
