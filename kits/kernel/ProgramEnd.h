// SPDX-License-Identifier: MIT
// What has to happen when the program ends, before the first static object goes.
#ifndef _PROGRAM_END_H
#define _PROGRAM_END_H

namespace BPrivate {

/// Has \a function called once, in the thread that ends the program, by exit() or by returning from main().
///
/// Before any handler of atexit() and any destructor of a static object when the thread is the main thread or
/// one of spawn_thread(); in other threads by a handler of atexit(). Not when the program is killed.
void call_at_program_end(void (*function)());

/// For the length of a thread's main function: tells its end from the program's.
class ThreadEndWatch {
public:
	ThreadEndWatch();
	~ThreadEndWatch();
};

} // namespace BPrivate

#endif // _PROGRAM_END_H
