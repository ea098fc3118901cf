// SPDX-License-Identifier: MIT
// The application object: its making, its loop and its hooks. See ApplicationQuit.cpp and ApplicationCursor.cpp for the
// rest.

#include <Application.h>

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <cstring>

#include <MessageRunner.h>
#include <Resources.h>
#include <Roster.h>
#include <String.h>

#include "app/LooperPort.h"
#include "app/Registry.h"
#include "app/RosterPrivate.h"
#include "app/StartArguments.h"
#include "kernel/Heap.h"

using BPrivate::CurrentThread;
using BPrivate::LooperPort;
using BPrivate::Registry;

BApplication* be_app = nullptr;
constinit BMessenger be_app_messenger;

static const char* const kSignatureField = "mime_sig";
static constexpr bigtime_t kPulseStep = 100'000;


/// Whether \a signature is "application/" and a subtype of the characters that MIME allows.
static bool
IsSignature(const char* signature)
{
	static const char* const kSupertype = "application/";
	if (signature == nullptr || strncasecmp(signature, kSupertype, strlen(kSupertype)) != 0
		|| strlen(signature) >= B_MIME_TYPE_LENGTH)
		return false;

	const char* subtype = signature + strlen(kSupertype);
	return subtype[0] != '\0' && std::all_of(subtype, subtype + strlen(subtype), [](char c) {
		return c > ' ' && c != 0x7f && strchr("/<>@,;:\"()[]?=", c) == nullptr;
	});
}


BApplication::BApplication(const char* signature)
	: BApplication(signature, nullptr)
{
}


BApplication::BApplication(const char* signature, status_t* error)
	: BLooper("application")
{
	InitData(signature, error);
}


BApplication::BApplication(BMessage* archive)
	: BLooper(archive)
{
	const char* signature;
	if (archive->FindString(kSignatureField, &signature) != B_OK)
		signature = nullptr;
	InitData(signature, nullptr);

	bigtime_t rate;
	if (archive->FindInt64("_pulse", &rate) == B_OK)
		SetPulseRate(rate);
}


BApplication::~BApplication()
{
	Lock();
	if (be_app == this) {
		QuitAllWindows(true);
		QuitRegisteredLoopers();
		BPrivate::UnregisterApplication();
		Registry::Default().SetApplicationPort(-1);
		be_app = nullptr;
		be_app_messenger = BMessenger();
	}
	delete fPulseRunner;
	free(fSignature);
}


BArchivable*
BApplication::Instantiate(BMessage* archive)
{
	return validate_instantiation(archive, "BApplication") ? new BApplication(archive) : nullptr;
}


status_t
BApplication::Archive(BMessage* archive, bool deep) const
{
	status_t status = BLooper::Archive(archive, deep);
	if (status == B_OK)
		status = archive->AddString(kSignatureField, Signature());
	if (status == B_OK)
		status = archive->AddInt64("_pulse", fPulseRate);
	return status;
}


status_t
BApplication::InitCheck() const
{
	return fInitError;
}


thread_id
BApplication::Run()
{
	if (fInitError != B_OK)
		return fInitError;
	if (fRunCalled || (!IsLocked() && !Lock()))
		return B_NOT_ALLOWED;

	fRunCalled = true;
	fPort->SetThread(CurrentThread());
	fPort->SetRunning();
	Unlock();
	EnterLoop();

	// No pulse reaches an application that has stopped listening.
	delete fPulseRunner;
	fPulseRunner = nullptr;
	return Thread();
}


void
BApplication::Pulse()
{
}


void
BApplication::ReadyToRun()
{
}


void
BApplication::MessageReceived(BMessage* message)
{
	BLooper::MessageReceived(message);
}


void
BApplication::ArgvReceived(int32, char**)
{
}


void
BApplication::AppActivated(bool)
{
}


void
BApplication::RefsReceived(BMessage*)
{
}


void
BApplication::AboutRequested()
{
}


void
BApplication::DispatchMessage(BMessage* message, BHandler* handler)
{
	if (handler != this) {
		BLooper::DispatchMessage(message, handler);
		return;
	}

	switch (message->what) {
		case B_ARGV_RECEIVED:
			HandleArgv(message);
			break;

		case B_REFS_RECEIVED:
			RefsReceived(message);
			break;

		case B_READY_TO_RUN:
			if (!fReadyToRunCalled) {
				ReadyToRun();
				fReadyToRunCalled = true;
			}
			break;

		case B_ABOUT_REQUESTED:
			AboutRequested();
			break;

		case B_PULSE:
			Pulse();
			break;

		case B_APP_ACTIVATED:
		{
			bool active;
			if (message->FindBool("active", &active) == B_OK) {
				BPrivate::SetApplicationActive(active);
				AppActivated(active);
			}
			break;
		}

		default:
			BLooper::DispatchMessage(message, handler);
			break;
	}
}


int32
BApplication::CountLoopers() const
{
	return int32(Registry::Default().Loopers().size());
}


BLooper*
BApplication::LooperAt(int32 index) const
{
	std::vector<std::shared_ptr<LooperPort>> loopers = Registry::Default().Loopers();
	return index >= 0 && size_t(index) < loopers.size() ? loopers[index]->Looper() : nullptr;
}


bool
BApplication::IsLaunching() const
{
	return !fReadyToRunCalled;
}


const char*
BApplication::Signature() const
{
	return fSignature;
}


status_t
BApplication::GetAppInfo(app_info* info) const
{
	if (fInitError != B_OK)
		return B_NO_INIT;
	return be_roster->GetRunningAppInfo(Team(), info);
}


BResources*
BApplication::AppResources()
{
	static BResources* resources = new BResources;
	return resources;
}


void
BApplication::SetPulseRate(bigtime_t rate)
{
	if (rate < 0 || !Lock())
		return;

	// The nearest multiple, but a rate that is asked for is not turned off.
	if (rate != 0)
		rate = std::max(kPulseStep, (rate + kPulseStep / 2) / kPulseStep * kPulseStep);
	if (rate != fPulseRate) {
		fPulseRate = rate;
		delete fPulseRunner;
		fPulseRunner = nullptr;
		BMessage pulse(B_PULSE);
		if (rate != 0)
			fPulseRunner = new BMessageRunner(BMessenger(this), &pulse, rate);
	}
	Unlock();
}


void
BApplication::InitData(const char* signature, status_t* error)
{
	fOutlivesLoop = true;
	fInitError = B_OK;
	fReadyToRunCalled = false;
	fPulseRate = 0;
	fPulseRunner = nullptr;
	fSignature = strdup(signature != nullptr ? signature : "");

	if (be_app != nullptr) {
		fprintf(stderr, "2 BApplication objects were created. Only one is allowed.\n");
		fInitError = B_NOT_ALLOWED;
	} else if (!IsSignature(signature)) {
		fprintf(stderr,
			"bad signature (%s), must be a MIME type that begins with \"application/\"\n",
			fSignature);
		fInitError = B_BAD_VALUE;
	}

	if (error != nullptr)
		*error = fInitError;
	else if (fInitError != B_OK)
		exit(EXIT_FAILURE);
	if (fInitError != B_OK)
		return;

	BPrivate::PrepareHeap();
	SetName(fSignature + strlen("application/"));
	fPort->SetThread(CurrentThread());
	Registry::Default().SetApplicationPort(fPort->Id());
	be_app = this;
	be_app_messenger = BMessenger(nullptr, this);
	BPrivate::RegisterApplication(fSignature, CurrentThread(), fPort->Id());
	QueueStartMessages();
}


/// Puts what the application gets first into its queue, before anybody else can post to it.
void
BApplication::QueueStartMessages()
{
	BMessage start;
	if (BPrivate::GetStartMessage(&start))
		PostMessage(&start, this);
	PostMessage(B_READY_TO_RUN, this);
}


void
BApplication::HandleArgv(BMessage* message)
{
	std::vector<BString> strings;
	BString string;
	for (int32 i = 0; message->FindString("argv", i, &string) == B_OK; i++)
		strings.push_back(string);

	// The strings are the hook's to write to, up to their ends.
	std::vector<char*> arguments;
	for (const BString& argument : strings)
		arguments.push_back(strdup(argument.String()));
	arguments.push_back(nullptr);
	ArgvReceived(int32(strings.size()), arguments.data());
	for (char* argument : arguments)
		free(argument);
}
