// SPDX-License-Identifier: MIT

#include "app/MainWindow.h"


ProjectWin*
PlimWin::ProjectWindow()
{
	return fProjectWindow;
}


PropertyWin*
PlimWin::PropertyWindow()
{
	return fPropertyWindow;
}


TDesignForm*
PlimWin::DesignForm()
{
	return fDesignForm;
}


ComponentPalette*
PlimWin::Palette()
{
	return fPalette;
}


PlimWin*
MainWindow()
{
	return nullptr;
}
