// SPDX-License-Identifier: MIT

#include "app/MainWindow.h"


PlimWin*
MainWindow()
{
	return nullptr;
}
