// SPDX-License-Identifier: MIT
// Knowing whether a property still exists.

#include "props/PropertyWatch.h"

#include <atomic>
#include <mutex>

namespace {

// Protects every watch and the list of them.
std::mutex sMutex;
TPropertyWatch* sFirst = nullptr;

// Properties are destroyed by the thousand, mostly while nobody watches one.
std::atomic<int> sCount = 0;

} // namespace

TPropertyWatch::TPropertyWatch(TProperty* property)
	: fProperty(property),
	  fPrevious(nullptr)
{
	std::lock_guard<std::mutex> lock(sMutex);
	fNext = sFirst;
	if (sFirst != nullptr)
		sFirst->fPrevious = this;
	sFirst = this;
	sCount++;
}


TPropertyWatch::~TPropertyWatch()
{
	std::lock_guard<std::mutex> lock(sMutex);
	if (fPrevious != nullptr)
		fPrevious->fNext = fNext;
	else
		sFirst = fNext;
	if (fNext != nullptr)
		fNext->fPrevious = fPrevious;
	sCount--;
}


void
TPropertyWatch::SetTo(TProperty* property)
{
	std::lock_guard<std::mutex> lock(sMutex);
	fProperty = property;
}


void
TPropertyWatch::SetTo(const TPropertyWatch& other)
{
	std::lock_guard<std::mutex> lock(sMutex);
	fProperty = other.fProperty;
}


TProperty*
TPropertyWatch::Property() const
{
	std::lock_guard<std::mutex> lock(sMutex);
	return fProperty;
}


void
TPropertyWatch::PropertyGone(const TProperty* property)
{
	if (sCount == 0)
		return;
	std::lock_guard<std::mutex> lock(sMutex);
	for (TPropertyWatch* watch = sFirst; watch != nullptr; watch = watch->fNext) {
		if (watch->fProperty == property)
			watch->fProperty = nullptr;
	}
}
