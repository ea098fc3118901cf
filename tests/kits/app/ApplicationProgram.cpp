// SPDX-License-Identifier: MIT
// A small application that prints which hooks are called, for ApplicationTest to start.

#include <cstdio>
#include <cstring>
#include <string>

#include <Application.h>
#include <Entry.h>
#include <Message.h>

/// One line a hook. Quits by itself when it is ready.
class LoggingApplication : public BApplication {
public:
	LoggingApplication()
		: BApplication("application/x-vnd.plim-logging")
	{
		// Whatever is posted here comes after the messages of the start.
		PostMessage('ctor');
		printf("constructed, launching=%d\n", IsLaunching());
	}

	void ArgvReceived(int32 argc, char** argv) override
	{
		printf("ArgvReceived %d", int(argc));
		for (int32 i = 1; i < argc; i++)
			printf(" [%s]", argv[i]);
		printf(" end=%d cwd=%d\n", argv[argc] == NULL, CurrentMessage()->HasString("cwd"));
	}

	void RefsReceived(BMessage* message) override
	{
		entry_ref ref;
		printf("RefsReceived");
		for (int32 i = 0; message->FindRef("refs", i, &ref) == B_OK; i++)
			printf(" [%s]", ref.name);
		printf("\n");
	}

	void ReadyToRun() override
	{
		printf("ReadyToRun, launching=%d\n", IsLaunching());
		PostMessage(B_READY_TO_RUN);
		PostMessage(B_ABOUT_REQUESTED);
		PostMessage(B_QUIT_REQUESTED);
	}

	void AboutRequested() override { printf("AboutRequested, launching=%d\n", IsLaunching()); }

	void MessageReceived(BMessage* message) override
	{
		if (message->what == 'ctor')
			printf("MessageReceived\n");
		else
			BApplication::MessageReceived(message);
	}

	bool QuitRequested() override
	{
		printf("QuitRequested\n");
		return BApplication::QuitRequested();
	}
};


int
main()
{
	LoggingApplication application;
	application.Run();
	printf("done\n");
	return 0;
}
