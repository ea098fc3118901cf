// SPDX-License-Identifier: MIT
// BList.

#include <List.h>

#include <gtest/gtest.h>

namespace {

char sItems[8];
void* const a = &sItems[0];
void* const b = &sItems[1];
void* const c = &sItems[2];
void* const d = &sItems[3];


std::vector<void*>
items(const BList& list)
{
	std::vector<void*> result;
	for (int32 i = 0; i < list.CountItems(); i++)
		result.push_back(list.ItemAt(i));
	return result;
}


BList
make_list(std::initializer_list<void*> pointers)
{
	BList list;
	for (void* pointer : pointers)
		list.AddItem(pointer);
	return list;
}


using Items = std::vector<void*>;


TEST(ListTest, AddsAtAnIndexInsideOnly)
{
	BList list(0);
	EXPECT_TRUE(list.AddItem(b));
	EXPECT_TRUE(list.AddItem(a, 0));
	EXPECT_TRUE(list.AddItem(c, 2));
	EXPECT_FALSE(list.AddItem(d, 4));
	EXPECT_FALSE(list.AddItem(d, -1));
	EXPECT_EQ(items(list), (Items{a, b, c}));
}


TEST(ListTest, AddsListsAndItself)
{
	BList list = make_list({a, b});
	EXPECT_TRUE(list.AddList(&list, 1));
	EXPECT_EQ(items(list), (Items{a, a, b, b}));
	BList other = make_list({c});
	EXPECT_TRUE(list.AddList(&other));
	EXPECT_EQ(list.LastItem(), c);
	EXPECT_FALSE(list.AddList(&other, 9));
	EXPECT_FALSE(list.AddList(nullptr));
	BList empty;
	EXPECT_TRUE(list.AddList(&empty));
	EXPECT_EQ(list.CountItems(), 5);
}


TEST(ListTest, RemovesTheFirstMatchOnly)
{
	BList list = make_list({a, b, a});
	EXPECT_TRUE(list.RemoveItem(a));
	EXPECT_EQ(items(list), (Items{b, a}));
	EXPECT_FALSE(list.RemoveItem(d));
}


TEST(ListTest, RemovesByIndex)
{
	BList list = make_list({a, b, c, d});
	EXPECT_EQ(list.RemoveItem(int32(1)), b);
	EXPECT_EQ(list.RemoveItem(int32(3)), nullptr);
	EXPECT_EQ(list.RemoveItem(int32(-1)), nullptr);
	EXPECT_FALSE(list.RemoveItems(-1, 1));
	EXPECT_FALSE(list.RemoveItems(4, 1));
	EXPECT_FALSE(list.RemoveItems(0, -1));
	EXPECT_TRUE(list.RemoveItems(1, 100));
	EXPECT_EQ(items(list), Items{a});
	EXPECT_TRUE(list.RemoveItems(1, 0));
	list.MakeEmpty();
	EXPECT_TRUE(list.IsEmpty());
}


TEST(ListTest, OutsideTheListThereIsNothing)
{
	BList list;
	EXPECT_EQ(list.FirstItem(), nullptr);
	EXPECT_EQ(list.LastItem(), nullptr);
	EXPECT_EQ(list.ItemAt(0), nullptr);
	EXPECT_EQ(list.ItemAt(-1), nullptr);
	EXPECT_EQ(list.Items(), nullptr);
	EXPECT_FALSE(list.ReplaceItem(0, a));
	EXPECT_FALSE(list.SwapItems(0, 0));
	EXPECT_FALSE(list.MoveItem(0, 0));
}


TEST(ListTest, FindsItems)
{
	BList list = make_list({a, b});
	EXPECT_EQ(list.IndexOf(b), 1);
	EXPECT_EQ(list.IndexOf(static_cast<const void*>(b)), 1);
	EXPECT_EQ(list.IndexOf(c), -1);
	EXPECT_TRUE(list.HasItem(a));
	EXPECT_FALSE(list.HasItem(static_cast<const void*>(c)));
	EXPECT_EQ(list.ItemAtFast(1), b);
	EXPECT_EQ(static_cast<void**>(list.Items())[1], b);
}


TEST(ListTest, MovesAndSwaps)
{
	BList list = make_list({a, b, c, d});
	EXPECT_TRUE(list.MoveItem(0, 2));
	EXPECT_EQ(items(list), (Items{b, c, a, d}));
	EXPECT_TRUE(list.MoveItem(3, 1));
	EXPECT_EQ(items(list), (Items{b, d, c, a}));
	EXPECT_FALSE(list.MoveItem(0, 4));
	EXPECT_TRUE(list.SwapItems(0, 3));
	EXPECT_EQ(items(list), (Items{a, d, c, b}));
	EXPECT_TRUE(list.ReplaceItem(1, b));
	EXPECT_EQ(list.ItemAt(1), b);
}


int
compare_backwards(const void* first, const void* second)
{
	const char* x = *static_cast<const char* const*>(first);
	const char* y = *static_cast<const char* const*>(second);
	return x > y ? -1 : (x < y ? 1 : 0);
}


TEST(ListTest, SortGetsPointersToTheItems)
{
	BList list = make_list({b, d, a, c});
	list.SortItems(&compare_backwards);
	EXPECT_EQ(items(list), (Items{d, c, b, a}));
	list.SortItems(nullptr);
	EXPECT_EQ(items(list), (Items{d, c, b, a}));
}


bool
stop_at_b(void* item, void* count)
{
	++*static_cast<int*>(count);
	return item == b;
}


TEST(ListTest, DoForEachStopsWhenToldTo)
{
	BList list = make_list({a, b, c});
	int count = 0;
	list.DoForEach(&stop_at_b, &count);
	EXPECT_EQ(count, 2);
	list.DoForEach(static_cast<bool (*)(void*)>(nullptr));
}


TEST(ListTest, ComparesAndCopiesByContent)
{
	BList list = make_list({a, b});
	BList copy(list);
	EXPECT_TRUE(copy == list);
	copy.AddItem(c);
	EXPECT_TRUE(copy != list);
	EXPECT_EQ(list.CountItems(), 2);
	list = copy;
	EXPECT_TRUE(copy == list);
}

} // namespace
