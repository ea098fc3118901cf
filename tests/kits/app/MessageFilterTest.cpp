// SPDX-License-Identifier: MIT
// BMessageFilter: which messages it sees, and what it does to them.

#include <MessageFilter.h>

#include <atomic>
#include <string>

#include <gtest/gtest.h>

#include <List.h>
#include <Messenger.h>

#include "Recorder.h"

static std::string sTrace;


/// Writes its letter into the trace and passes or drops the message.
class LetterFilter : public BMessageFilter {
public:
	LetterFilter(char letter, filter_result result = B_DISPATCH_MESSAGE, BHandler* target = NULL)
		: BMessageFilter(B_ANY_DELIVERY, B_ANY_SOURCE),
		  fLetter(letter),
		  fResult(result),
		  fTarget(target)
	{
	}
	~LetterFilter() override { sDeleted++; }

	filter_result Filter(BMessage*, BHandler** target) override
	{
		sTrace += fLetter;
		if (fTarget != NULL)
			*target = fTarget;
		return fResult;
	}

	static std::atomic<int32> sDeleted;

private:
	char fLetter;
	filter_result fResult;
	BHandler* fTarget;
};

std::atomic<int32> LetterFilter::sDeleted(0);


/// A looper that is not running with two handlers; Dispatch() handles what was posted.
class MessageFilterTest : public testing::Test {
protected:
	MessageFilterTest()
	{
		sTrace.clear();
		LetterFilter::sDeleted = 0;
		looper->AddHandler(&one);
		looper->AddHandler(&two);
	}

	void Dispatch()
	{
		looper->Run();
		QuitLooper(looper);
	}

	RecordingLooper* looper = new RecordingLooper;
	RecordingHandler one;
	RecordingHandler two;
};


TEST_F(MessageFilterTest, CommonFiltersRunBeforeTheTargetsOwnInTheOrderOfAdding)
{
	one.AddFilter(new LetterFilter('c'));
	one.AddFilter(new LetterFilter('d'));
	looper->AddCommonFilter(new LetterFilter('a'));
	looper->AddCommonFilter(new LetterFilter('b'));
	two.AddFilter(new LetterFilter('x'));
	looper->PostMessage(1, &one);
	Dispatch();
	EXPECT_EQ(sTrace, "abcd");
	EXPECT_EQ(one.record.Codes(), (std::vector<uint32>{1}));
}


TEST_F(MessageFilterTest, SkipDropsTheMessageAndAsksNoFurtherFilter)
{
	looper->AddCommonFilter(new LetterFilter('a', B_SKIP_MESSAGE));
	looper->AddCommonFilter(new LetterFilter('b'));
	looper->PostMessage(1, &one);
	Dispatch();
	EXPECT_EQ(sTrace, "a");
	EXPECT_TRUE(one.record.Codes().empty());
}


TEST_F(MessageFilterTest, MayRedirectToAnotherHandlerWhoseFiltersThenRun)
{
	one.AddFilter(new LetterFilter('a', B_DISPATCH_MESSAGE, &two));
	two.AddFilter(new LetterFilter('b'));
	looper->PostMessage(1, &one);
	Dispatch();
	EXPECT_EQ(sTrace, "ab");
	EXPECT_TRUE(one.record.Codes().empty());
	EXPECT_EQ(two.record.Codes(), (std::vector<uint32>{1}));
}


TEST_F(MessageFilterTest, ARedirectionOutOfTheLooperDropsTheMessage)
{
	RecordingHandler outside;
	looper->AddCommonFilter(new LetterFilter('a', B_DISPATCH_MESSAGE, &outside));
	looper->PostMessage(1, &one);
	Dispatch();
	EXPECT_TRUE(outside.record.Codes().empty());
	EXPECT_TRUE(one.record.Codes().empty());
}


static filter_result
TraceCode(BMessage* message, BHandler** target, BMessageFilter* filter)
{
	sTrace += char(message->what);
	EXPECT_EQ(filter->Looper(), (*target)->Looper());
	return B_DISPATCH_MESSAGE;
}


TEST_F(MessageFilterTest, AFilterForOneCodeSeesNoOther)
{
	looper->AddCommonFilter(new BMessageFilter('b', TraceCode));
	for (uint32 what : {'a', 'b', 'c'})
		looper->PostMessage(what, &one);
	Dispatch();
	EXPECT_EQ(sTrace, "b");
	EXPECT_EQ(one.record.Codes().size(), 3u);
}


TEST_F(MessageFilterTest, SeesOnlyWhatCameTheWayItAsksFor)
{
	looper->AddCommonFilter(new BMessageFilter(B_DROPPED_DELIVERY, B_ANY_SOURCE, TraceCode));
	looper->AddCommonFilter(new BMessageFilter(B_ANY_DELIVERY, B_REMOTE_SOURCE, TraceCode));
	looper->PostMessage('a', &one);
	looper->AddCommonFilter(new BMessageFilter(B_PROGRAMMED_DELIVERY, B_LOCAL_SOURCE, TraceCode));
	Dispatch();
	EXPECT_EQ(sTrace, "a");
}


TEST_F(MessageFilterTest, FiltersAreDeletedWithTheirHandlerOrLooper)
{
	{
		BHandler handler;
		handler.AddFilter(new LetterFilter('a'));
	}
	EXPECT_EQ(LetterFilter::sDeleted, 1);
	looper->AddCommonFilter(new LetterFilter('b'));
	looper->Quit();
	EXPECT_EQ(LetterFilter::sDeleted, 2);
}


TEST_F(MessageFilterTest, ARemovedFilterIsTheCallersAndFreeForAnotherList)
{
	LetterFilter filter('a');
	one.AddFilter(&filter);
	EXPECT_EQ(filter.Looper(), looper);
	two.AddFilter(&filter);
	EXPECT_EQ(two.FilterList(), nullptr);
	EXPECT_FALSE(looper->RemoveCommonFilter(&filter));
	EXPECT_FALSE(two.RemoveFilter(&filter));
	EXPECT_TRUE(one.RemoveFilter(&filter));
	EXPECT_EQ(filter.Looper(), nullptr);

	looper->AddCommonFilter(&filter);
	EXPECT_EQ(looper->CommonFilterList()->CountItems(), 1);
	EXPECT_TRUE(looper->RemoveCommonFilter(&filter));
	looper->Quit();
}


TEST_F(MessageFilterTest, ANewListReplacesTheOldFilters)
{
	one.AddFilter(new LetterFilter('a'));
	BList* list = new BList;
	list->AddItem(new LetterFilter('b'));
	one.SetFilterList(list);
	EXPECT_EQ(LetterFilter::sDeleted, 1);
	EXPECT_EQ(one.FilterList(), list);
	looper->PostMessage(1, &one);
	Dispatch();
	EXPECT_EQ(sTrace, "b");
}


static filter_result
RemoveMyself(BMessage*, BHandler** target, BMessageFilter* filter)
{
	sTrace += 'r';
	(*target)->RemoveFilter(filter);
	delete filter;
	return B_DISPATCH_MESSAGE;
}


TEST_F(MessageFilterTest, MayRemoveItself)
{
	one.AddFilter(new BMessageFilter(B_ANY_DELIVERY, B_ANY_SOURCE, RemoveMyself));
	looper->PostMessage(1, &one);
	looper->PostMessage(2, &one);
	Dispatch();
	EXPECT_EQ(sTrace, "r");
	EXPECT_EQ(one.record.Codes(), (std::vector<uint32>{1, 2}));
}


static filter_result
DeleteTarget(BMessage*, BHandler** target, BMessageFilter*)
{
	delete *target;
	return B_SKIP_MESSAGE;
}


TEST_F(MessageFilterTest, MayDeleteTheHandlerThatItBelongsTo)
{
	RecordingHandler* victim = new RecordingHandler;
	looper->AddHandler(victim);
	victim->AddFilter(new BMessageFilter(B_ANY_DELIVERY, B_ANY_SOURCE, DeleteTarget));
	looper->PostMessage(1, victim);
	looper->PostMessage(2, &one);
	Dispatch();
	EXPECT_EQ(one.record.Codes(), (std::vector<uint32>{2}));
}


TEST(MessageFilterValuesTest, CopiesTakeTheConditions)
{
	BMessageFilter filter(B_DROPPED_DELIVERY, B_LOCAL_SOURCE, 'code');
	BMessageFilter copy(filter);
	BMessageFilter assigned(B_ANY_DELIVERY, B_ANY_SOURCE);
	EXPECT_TRUE(assigned.FiltersAnyCommand());
	assigned = filter;
	for (const BMessageFilter* each : {&copy, &assigned}) {
		EXPECT_EQ(each->MessageDelivery(), B_DROPPED_DELIVERY);
		EXPECT_EQ(each->MessageSource(), B_LOCAL_SOURCE);
		EXPECT_EQ(each->Command(), uint32('code'));
		EXPECT_FALSE(each->FiltersAnyCommand());
		EXPECT_EQ(each->Looper(), nullptr);
	}
}
