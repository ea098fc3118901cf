// SPDX-License-Identifier: MIT
// Sends a message again and again.

#include <MessageRunner.h>

#include <Message.h>

#include "app/RunnerService.h"

using BPrivate::RunnerService;

static constexpr int64 kNoRunner = -1;


static status_t
CheckArguments(const BMessenger& target, const BMessage* message, bigtime_t interval, int32 count)
{
	if (message == nullptr || interval <= 0 || !target.IsValid())
		return B_BAD_VALUE;
	return count != 0 ? B_OK : B_ERROR;
}


BMessageRunner::BMessageRunner(
	BMessenger target, const BMessage* message, bigtime_t interval, int32 count)
	: BMessageRunner(target, message, interval, count, BMessenger())
{
}


BMessageRunner::BMessageRunner(
	BMessenger target, const BMessage& message, bigtime_t interval, int32 count)
	: BMessageRunner(target, &message, interval, count, BMessenger())
{
}


BMessageRunner::BMessageRunner(
	BMessenger target, const BMessage* message, bigtime_t interval, int32 count, BMessenger replyTo)
	: fToken(kNoRunner),
	  fStatus(CheckArguments(target, message, interval, count))
{
	if (fStatus == B_OK)
		fToken = RunnerService::Default().Add(target, *message, interval, count, replyTo);
}


BMessageRunner::BMessageRunner(
	BMessenger target, const BMessage& message, bigtime_t interval, int32 count, BMessenger replyTo)
	: BMessageRunner(target, &message, interval, count, replyTo)
{
}


BMessageRunner::~BMessageRunner()
{
	if (fStatus == B_OK)
		RunnerService::Default().Remove(fToken);
}


status_t
BMessageRunner::InitCheck() const
{
	return fStatus;
}


status_t
BMessageRunner::SetInterval(bigtime_t interval)
{
	if (fStatus != B_OK || interval <= 0)
		return B_BAD_VALUE;
	return RunnerService::Default().SetInterval(fToken, interval) ? B_OK : B_BAD_VALUE;
}


status_t
BMessageRunner::SetCount(int32 count)
{
	if (fStatus != B_OK || count == 0)
		return B_BAD_VALUE;
	return RunnerService::Default().SetCount(fToken, count) ? B_OK : B_BAD_VALUE;
}


status_t
BMessageRunner::GetInfo(bigtime_t* interval, int32* count) const
{
	if (fStatus != B_OK)
		return B_BAD_VALUE;
	return RunnerService::Default().GetInfo(fToken, interval, count) ? B_OK : B_BAD_VALUE;
}


status_t
BMessageRunner::StartSending(
	BMessenger target, const BMessage* message, bigtime_t interval, int32 count)
{
	return StartSending(target, message, interval, count, BMessenger());
}


status_t
BMessageRunner::StartSending(
	BMessenger target, const BMessage* message, bigtime_t interval, int32 count, BMessenger replyTo)
{
	status_t status = CheckArguments(target, message, interval, count);
	if (status == B_OK)
		RunnerService::Default().Add(target, *message, interval, count, replyTo);
	return status;
}
