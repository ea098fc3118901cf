// SPDX-License-Identifier: MIT
// An add-on that wants a function that nobody has.

extern "C" int a_function_that_nobody_has();


extern "C" int
addon_function()
{
	return a_function_that_nobody_has();
}
