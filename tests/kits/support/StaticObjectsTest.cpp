// SPDX-License-Identifier: MIT
// Static objects use the kits before main() and after it.

#include <stdio.h>
#include <unistd.h>

#include <Autolock.h>
#include <DataIO.h>
#include <List.h>
#include <Locker.h>
#include <Message.h>
#include <OS.h>
#include <String.h>
#include <StringList.h>

#include <gtest/gtest.h>

namespace {

/// Works with everything that has to work at any time; false when something did not.
bool
use_kits()
{
	BString string("text");
	string << 5;
	BList list;
	list.AddItem(&string);
	BStringList strings;
	strings.Add(string);
	BMallocIO stream;
	BMessage message('test');
	message.AddString("name", string);

	BLocker locker("static");
	BAutolock lock(locker);
	sem_id semaphore = create_sem(1, "static");
	port_id port = create_port(1, "static");
	bool good = lock.IsLocked() && acquire_sem(semaphore) == B_OK
		&& acquire_sem_etc(semaphore, 1, B_RELATIVE_TIMEOUT, 100) == B_TIMED_OUT
		&& write_port(port, 1, "x", 1) == B_OK && port_count(port) == 1 && find_thread(nullptr) > 0
		&& stream.Write("abc", 3) == 3 && message.FindString("name", &string) == B_OK
		&& string == "text5";
	delete_sem(semaphore);
	delete_port(port);

	status_t result = B_ERROR;
	thread_id thread =
		spawn_thread([](void*) -> status_t { return 17; }, "static", B_NORMAL_PRIORITY, nullptr);
	return good && wait_for_thread(thread, &result) == B_OK && result == 17;
}


class StaticUser {
public:
	StaticUser()
		: fText("static"),
		  fWorked(use_kits())
	{
	}
	~StaticUser()
	{
		// Too late for the test's own means to fail.
		if (fText == "static" && use_kits())
			return;
		fprintf(stderr, "the kits do not work after main()\n");
		_exit(3);
	}

	bool Worked() const { return fWorked; }

private:
	BString fText;
	bool fWorked;
};

StaticUser sUser;


TEST(StaticObjectsTest, WorkBeforeMain)
{
	EXPECT_TRUE(sUser.Worked());
}


TEST(StaticObjectsTest, WorkAfterMain)
{
	EXPECT_EXIT(exit(0), testing::ExitedWithCode(0), "");
}

} // namespace
