// SPDX-License-Identifier: MIT
// An add-on that needs a library that is not there.

extern "C" int gone_function();


extern "C" int
addon_function()
{
	return gone_function();
}
