// SPDX-License-Identifier: MIT

#include "PictureMaking.h"

#include <InterfaceDefs.h>
#include <Picture.h>
#include <View.h>

std::unique_ptr<BPicture>
MakeLamp(BView* view, rgb_color color, bool lit)
{
	std::unique_ptr<BPicture> picture(new BPicture);
	view->BeginPicture(picture.get());
	view->PushState();
	view->SetHighColor(lit ? color : tint_color(color, B_DARKEN_3_TINT));
	view->FillEllipse(BRect(4, 4, 27, 27));
	view->SetHighColor(tint_color(color, B_DARKEN_4_TINT));
	view->StrokeEllipse(BRect(4, 4, 27, 27));
	if (lit) {
		view->SetHighColor(tint_color(color, B_LIGHTEN_2_TINT));
		view->FillEllipse(BRect(9, 8, 15, 14));
	}
	view->PopState();
	view->EndPicture();
	return picture;
}
