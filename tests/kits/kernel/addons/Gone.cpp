// SPDX-License-Identifier: MIT
// A library that is not there any more when the add-on that needs it is loaded.

extern "C" int
gone_function()
{
	return 1;
}
