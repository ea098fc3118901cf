// SPDX-License-Identifier: MIT
// The program's one application object: the loop of its main thread, its windows, its cursor.

#ifndef _APPLICATION_H
#define _APPLICATION_H

#include <vector>

#include <AppDefs.h>
#include <InterfaceDefs.h>
#include <Looper.h>
#include <Messenger.h>

class BCursor;
class BMessageRunner;
class BResources;
class BWindow;
struct app_info;


/// The application: a looper whose loop Run() runs in the calling thread. One may exist at a time.
///
/// It is made locked. Windows made before Run() run at once; the application's own messages wait for Run().
class BApplication : public BLooper {
public:
	/// \a signature: a MIME type such as "application/x-vnd.example". A bad one, or a second application, ends the
	/// program with a message on standard error; the second form reports it by \a error instead (B_BAD_VALUE,
	/// B_NOT_ALLOWED).
	BApplication(const char* signature);
	BApplication(const char* signature, status_t* error);
	BApplication(BMessage* archive);
	/// Quits the windows that are left, without asking them.
	virtual ~BApplication();

	static BArchivable* Instantiate(BMessage* archive);
	virtual status_t Archive(BMessage* archive, bool deep = true) const override;

	status_t InitCheck() const;

	/// Runs the loop; returns after Quit(). The object stays the caller's.
	virtual thread_id Run() override;
	/// Makes Run() return after the current message. The object is not deleted, unless it never ran.
	virtual void Quit() override;
	/// Asks all windows and quits those that agree, file panels last; false as soon as one refuses.
	virtual bool QuitRequested() override;
	virtual void Pulse();
	/// Called once, after the arguments or files of the start.
	virtual void ReadyToRun();
	virtual void MessageReceived(BMessage* message) override;
	/// The program's arguments, of this or a later start; they live until it returns.
	virtual void ArgvReceived(int32 argc, char** argv);
	virtual void AppActivated(bool active);
	/// Files to open: "refs".
	virtual void RefsReceived(BMessage* message);
	virtual void AboutRequested();
	virtual void DispatchMessage(BMessage* message, BHandler* handler) override;

	void ShowCursor();
	void HideCursor();
	void ObscureCursor();
	bool IsCursorHidden() const;
	/// \a cursor: B_HAND_CURSOR, B_I_BEAM_CURSOR or 68 bytes of that form.
	void SetCursor(const void* cursor);
	void SetCursor(const BCursor* cursor, bool sync = true);

	/// The program's windows in order of creation, menus left out.
	int32 CountWindows() const;
	BWindow* WindowAt(int32 index) const;
	int32 CountLoopers() const;
	BLooper* LooperAt(int32 index) const;

	/// Whether ReadyToRun() is still to come.
	bool IsLaunching() const;
	const char* Signature() const;
	/// This program's thread, team, file, flags and signature.
	status_t GetAppInfo(app_info* info) const;
	/// An empty set: programs carry no resources of that form here.
	static BResources* AppResources();

	/// Calls Pulse() every \a rate microseconds (multiples of 100000); 0 turns it off.
	void SetPulseRate(bigtime_t rate);

	/// Makes the destructor quit \a looper too, after the windows. B_BAD_VALUE for NULL or a window, B_ERROR when it
	/// is registered (for the second: is not).
	status_t RegisterLooper(BLooper* looper);
	status_t UnregisterLooper(BLooper* looper);

private:
	void InitData(const char* signature, status_t* error);
	void QueueStartMessages();
	void HandleArgv(BMessage* message);
	bool QuitAllWindows(bool force);
	void QuitRegisteredLoopers();

	status_t fInitError;
	char* fSignature;
	bool fReadyToRunCalled;
	bigtime_t fPulseRate;
	BMessageRunner* fPulseRunner;
	std::vector<BLooper*> fRegisteredLoopers;
};

/// The application object, NULL when there is none.
extern BApplication* be_app;
/// A messenger to it; invalid when there is none.
extern BMessenger be_app_messenger;

#endif // _APPLICATION_H
