// SPDX-License-Identifier: MIT
// A component library without components that prints on standard output in every way there is.

#include <stdio.h>
#include <unistd.h>

#include <iostream>

#include <ComponentKit.h>
#include <image.h>

extern "C" bool
InitComponentLib(image_id)
{
	printf("noise of printf\n");
	puts("noise of puts");
	std::cout << "noise of a stream" << std::endl;
	fflush(stdout);
	const char text[] = "noise of write\n";
	return write(STDOUT_FILENO, text, sizeof(text) - 1) > 0;
}


extern "C" void
UnInitComponentLib()
{
}


extern "C" uint32
CountComponents()
{
	return 0;
}


extern "C" TPaletteEntry*
EntryAt(uint32)
{
	return nullptr;
}
