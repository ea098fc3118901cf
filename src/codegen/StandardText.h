// SPDX-License-Identifier: MIT
// Texts as standard C++ writes them: string literals, comments, statements.

#pragma once

#include <string_view>

#include <String.h>

/// \a text as what stands between the quotes of a string literal, on one line.
///
/// Valid UTF-8 is kept. Quotes, backslashes, control characters, trigraphs, invalid bytes and the marks that
/// turn the direction of writing are escaped, and a "$" where a placeholder could begin.
BString EscapedText(std::string_view text);

/// \a text as a string literal with its quotes; a long one is divided, with a line for each piece.
BString StringLiteral(std::string_view text);

/// \a text as part of a line comment, which it cannot end or continue.
BString CommentText(std::string_view text);

/// \a source with plain spaces in place of others (such as no-break spaces) in its code, and without what
/// compilers refuse or warn of in its literals. Escapes and raw strings are kept, and so are comments.
BString PlainSource(std::string_view source);

/// The statement that the template \a statement stands for: "$COMPONENT" becomes \a component; "$VALUE" becomes
/// \a value, escaped where it stands in a string literal.
BString FilledStatement(std::string_view statement, const char* component, std::string_view value);
