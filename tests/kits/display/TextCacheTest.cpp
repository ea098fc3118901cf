// SPDX-License-Identifier: MIT
// The limit of what is kept of texts, which the environment sets to 32 kB here.
#include <cstdlib>
#include <string>

#include <Application.h>
#include <Font.h>
#include <gtest/gtest.h>
#include <malloc.h>

namespace {

size_t
HeapInUse()
{
	const struct mallinfo2 heap = mallinfo2();
	return heap.uordblks + heap.hblkhd;
}


/// The widths of \a count texts that were not measured before, added up.
float
MeasureTexts(int first, int count)
{
	float sum = 0;
	for (int i = first; i < first + count; i++)
		sum += be_plain_font->StringWidth(("Text " + std::to_string(i)).c_str());
	return sum;
}

} // namespace


TEST(TextCacheTest, TakesNoMoreThanItMay)
{
	ASSERT_STREQ(getenv("BE_TEXT_CACHE"), "32");
	BApplication application("application/x-vnd.Plimworks-TextCacheTest");
	MeasureTexts(1000, 500);
	const size_t before = HeapInUse();
	MeasureTexts(2000, 5000);
	EXPECT_LT(HeapInUse(), before + 256 * 1024);
}


TEST(TextCacheTest, ForgottenTextsAreMeasuredAnew)
{
	BApplication application("application/x-vnd.Plimworks-TextCacheTest");
	const float sum = MeasureTexts(1000, 3000);
	EXPECT_GT(sum, 0);
	EXPECT_EQ(MeasureTexts(1000, 3000), sum);
}
