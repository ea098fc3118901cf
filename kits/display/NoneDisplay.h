// SPDX-License-Identifier: MIT
// The display that draws nothing: windows have frames and states, input can be injected.
#ifndef DISPLAY_NONE_DISPLAY_H
#define DISPLAY_NONE_DISPLAY_H

#include "display/Display.h"
#include "display/InputHub.h"
#include "display/NoneFonts.h"

namespace BPrivate {

/// One screen of 1024 x 768 at scale 1, estimated fonts, canvases without pixels, no clipboard but the
/// program's own. The window shown or pressed last is the active one.
class NoneDisplay : public Display {
public:
	NoneDisplay();

	const char* Name() const override;
	bool DrawsPixels() const override;
	std::unique_ptr<HostWindow> MakeWindow(BRect frame, const char* title,
		const HostWindowStyle& style, HostWindowClient* client) override;
	std::unique_ptr<Canvas> MakeCanvas(int32 width, int32 height, float scale) override;
	std::unique_ptr<Canvas> MakeCanvas(const PixelBuffer& buffer) override;
	FontEngine& Fonts() override;
	int32 CountScreens() override;
	BRect ScreenFrame(int32 index) override;
	status_t ReadScreen(BRect frame, Picture* picture) override;
	void Beep() override;
	void GetPointer(BPoint* screenWhere, uint32* buttons) override;
	void GetKeys(key_info* info) override;
	bigtime_t IdleTime() override;
	void BeginRectTracking(BRect rect, uint32 style, BPoint from) override;
	void EndRectTracking() override;
	void BeginDrag(
		const BMessage& message, BRect rect, const PixelBuffer* image, BPoint offset) override;
	status_t DecodePicture(const void* data, size_t size, Picture* picture) override;
	status_t SavePicture(const Picture& picture, const char* path) override;
	void Sync() override {}
	void InjectPointer(BPoint screenWhere, uint32 buttons) override;
	void InjectWheel(float deltaX, float deltaY) override;
	void InjectKey(const InjectedKey& key, bool down) override;
	void InjectDrop(std::unique_ptr<BMessage> message, BPoint screenWhere) override;

	void SetApplicationCursor(std::shared_ptr<const CursorShape> shape) override;
	void SetCursorHidden(bool hidden) override;
	void ObscureCursor() override;
	status_t Get(BMessage* data) override;
	status_t Put(const BMessage& data) override;

private:
	InputHub fHub;
	NoneFonts fFonts;
};

} // namespace BPrivate

#endif // DISPLAY_NONE_DISPLAY_H
