// SPDX-License-Identifier: MIT
// The pages of the gallery, one for each kind of control.
#ifndef GALLERY_PAGES_H
#define GALLERY_PAGES_H

#include <Rect.h>

class BView;

/// Each makes a view with this frame, which is named as its tab is to be labelled.
BView* MakeButtonsPage(BRect frame);
BView* MakeTextPage(BRect frame);
BView* MakeSlidersPage(BRect frame);
BView* MakeBarsPage(BRect frame);
BView* MakeColorsPage(BRect frame);
BView* MakeTabsPage(BRect frame);
BView* MakeListsPage(BRect frame);
BView* MakeMenusPage(BRect frame);
BView* MakeDialogsPage(BRect frame);

/// A view for a page, in the panel's colour.
BView* MakePage(BRect frame, const char* name);

/// A line of text above or beside what it explains.
void AddCaption(BView* page, float left, float top, const char* text);

#endif // GALLERY_PAGES_H
