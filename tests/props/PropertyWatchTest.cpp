// SPDX-License-Identifier: MIT

#include "props/PropertyWatch.h"

#include <memory>

#include <gtest/gtest.h>

#include "model/Property.h"

TEST(PropertyWatchTest, RefersToItsProperty)
{
	TProperty property(nullptr, "Name", "value", nullptr, true);
	TPropertyWatch watch(&property);
	EXPECT_EQ(watch.Property(), &property);
	watch.SetTo(nullptr);
	EXPECT_EQ(watch.Property(), nullptr);
}


TEST(PropertyWatchTest, RefersToNoneWhenThePropertyIsGone)
{
	auto property = std::make_unique<TProperty>(nullptr, "Name", "value", nullptr, true);
	TProperty other(nullptr, "Other", "value", nullptr, true);
	TPropertyWatch first(property.get());
	TPropertyWatch second;
	second.SetTo(first);
	TPropertyWatch third(&other);
	property.reset();
	EXPECT_EQ(first.Property(), nullptr);
	EXPECT_EQ(second.Property(), nullptr);
	EXPECT_EQ(third.Property(), &other);
}


TEST(PropertyWatchTest, PropertiesOutliveTheirWatches)
{
	TProperty property(nullptr, "Name", "value", nullptr, true);
	{
		TPropertyWatch first(&property);
		TPropertyWatch second(&property);
		TPropertyWatch third(&property);
	}
	TPropertyWatch last(&property);
	EXPECT_EQ(last.Property(), &property);
}
