// SPDX-License-Identifier: MIT
// What the programs that open windows full of buttons have in common, whatever they are made with.
//
// Each opens a window with one button. By lines on its standard input it is told to "open" another one with COUNT
// buttons and to "repaint" that one wholly; it prints the word, and the time when it began with it. The last thing
// that each window paints is a mark in its right bottom corner, in another colour each time: who sees that
// colour on the screen knows that the window is painted. The end of the input ends the program.

#pragma once

#include <cstdio>
#include <cstdlib>
#include <ctime>
#include <string>

namespace ButtonWindow {

const int kColumns = 25;
const int kButtonWidth = 81;
const int kButtonHeight = 25;
const int kMarkSize = 16;
const int kFontSize = 12;

struct Frame {
	int left;
	int top;
	int width;
	int height;
};

const Frame kSmall = {2240, 40, 140, 80};
const Frame kLarge = {8, 40, 2216, 1320};


inline Frame
ButtonAt(int index)
{
	return {8 + 88 * (index % kColumns), 8 + 32 * (index / kColumns), kButtonWidth, kButtonHeight};
}


inline std::string
LabelOf(int index)
{
	return "Button" + std::to_string(index + 1);
}


inline Frame
MarkIn(const Frame& window)
{
	return {window.width - kMarkSize, window.height - kMarkSize, kMarkSize, kMarkSize};
}


/// Red at first, then blue and red by turns.
inline unsigned
MarkColor(int paintings)
{
	return paintings % 2 == 0 ? 0xc80000 : 0x0000c8;
}


/// The word and the clock in nanoseconds.
inline void
Tell(const char* word)
{
	timespec now;
	clock_gettime(CLOCK_MONOTONIC, &now);
	printf("%s %lld\n", word, static_cast<long long>(now.tv_sec) * 1000000000 + now.tv_nsec);
	fflush(stdout);
}


inline int
CountFrom(int argc, char** argv)
{
	if (argc == 2)
		return atoi(argv[1]);
	fprintf(stderr, "usage: %s COUNT\n", argv[0]);
	exit(2);
}

} // namespace ButtonWindow
