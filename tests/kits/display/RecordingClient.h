// SPDX-License-Identifier: MIT
// Keeps what a display tells a window.
#ifndef TESTS_KITS_DISPLAY_RECORDING_CLIENT_H
#define TESTS_KITS_DISPLAY_RECORDING_CLIENT_H

#include <memory>
#include <mutex>
#include <string>
#include <vector>

#include <AppDefs.h>
#include <Message.h>

#include "display/HostWindow.h"

class RecordingClient : public BPrivate::HostWindowClient {
public:
	void Deliver(std::unique_ptr<BMessage> message) override
	{
		std::lock_guard<std::mutex> lock(fMutex);
		fMessages.push_back(*message);
	}

	void Dropped(std::unique_ptr<BMessage> message, BPoint screenWhere, BPoint offset) override
	{
		std::lock_guard<std::mutex> lock(fMutex);
		message->AddPoint("test:where", screenWhere);
		message->AddPoint("test:offset", offset);
		fDrops.push_back(*message);
	}

	void NeedsRedraw() override {}

	/// What came since the last call, in short: "down", "up", "move", "leave", "wheel", "key", ...
	std::string Codes()
	{
		std::lock_guard<std::mutex> lock(fMutex);
		std::string codes;
		for (; fRead < fMessages.size(); fRead++)
			codes += (codes.empty() ? "" : " ") + NameOf(fMessages[fRead]);
		return codes;
	}

	BMessage Last()
	{
		std::lock_guard<std::mutex> lock(fMutex);
		return fMessages.empty() ? BMessage() : fMessages.back();
	}

	std::vector<BMessage> Drops()
	{
		std::lock_guard<std::mutex> lock(fMutex);
		return fDrops;
	}

private:
	static std::string NameOf(const BMessage& message)
	{
		bool active = false;
		switch (message.what) {
			case B_MOUSE_DOWN:
				return "down";
			case B_MOUSE_UP:
				return "up";
			case B_MOUSE_MOVED:
				return message.HasInt32("be:transit") ? "leave" : "move";
			case B_MOUSE_WHEEL_CHANGED:
				return "wheel";
			case B_KEY_DOWN:
				return "key";
			case B_KEY_UP:
				return "key-up";
			case B_UNMAPPED_KEY_DOWN:
				return "unmapped";
			case B_UNMAPPED_KEY_UP:
				return "unmapped-up";
			case B_MODIFIERS_CHANGED:
				return "modifiers";
			case B_WINDOW_ACTIVATED:
				message.FindBool("active", &active);
				return active ? "active" : "inactive";
			case B_WINDOW_MOVED:
				return "moved";
			case B_WINDOW_RESIZED:
				return "resized";
			case B_MINIMIZE:
				message.FindBool("minimize", &active);
				return active ? "minimized" : "restored";
			case B_ZOOM:
				return "zoomed";
			default:
				return "other";
		}
	}

	std::mutex fMutex;
	std::vector<BMessage> fMessages;
	std::vector<BMessage> fDrops;
	size_t fRead = 0;
};

#endif // TESTS_KITS_DISPLAY_RECORDING_CLIENT_H
