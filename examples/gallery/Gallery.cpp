// SPDX-License-Identifier: MIT
// The gallery: every control of the Interface Kit in every state.

#include <Application.h>

#include "GalleryWindow.h"

namespace {

class GalleryApp : public BApplication {
public:
	GalleryApp()
		: BApplication("application/x-vnd.plimworks-gallery")
	{
	}

	void ReadyToRun() override { (new GalleryWindow)->Show(); }
};

} // namespace


int
main()
{
	GalleryApp app;
	app.Run();
	return 0;
}
