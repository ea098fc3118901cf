// SPDX-License-Identifier: MIT
// The text form of messages in the samples: writing it from a message, and building a message from it.
#ifndef TESTS_KITS_APP_MESSAGE_TEXT_H
#define TESTS_KITS_APP_MESSAGE_TEXT_H

#include <string>

class BMessage;


/// The message as lines of text, found through the public operations only.
std::string MessageText(const BMessage& message);

/// Adds the fields of a text, one item after the other in its order. False for a text that is not
/// understood, or an item that cannot be added.
bool BuildMessage(const std::string& text, BMessage* message);

/// The whole message in the Haiku format.
std::string FlatBytes(const BMessage& message);

/// The content of a file in the samples' folder; fails the test when it cannot be read.
std::string ReadSample(const std::string& fileName);

/// Bytes from hexadecimal digits; spaces and line ends count nothing.
std::string Bytes(const char* hexadecimal);

#endif // TESTS_KITS_APP_MESSAGE_TEXT_H
