// SPDX-License-Identifier: MIT
// Reading a flattened message from a stream whose end, and whose honesty, are not known beforehand.
#ifndef _MESSAGE_STREAM_H
#define _MESSAGE_STREAM_H

#include <memory>

#include <SupportDefs.h>

class BDataIO;
class BPositionIO;
class MessageBytes;


/// The bytes of a stream from its position on, as far as they were asked for.
///
/// Memory grows with the bytes that really come, never with what a header claims. A stream that can be
/// positioned is read in larger pieces and set back by Finish(); any other is not read any further
/// than asked.
class MessageStream {
public:
	explicit MessageStream(BDataIO* stream);

	/// Makes at least \a size bytes available. B_BAD_VALUE when the stream ends before; the stream's
	/// error when reading fails.
	status_t Fill(uint64 size);

	/// Sets the stream's position behind the first \a used bytes.
	status_t Finish(size_t used);

	/// Gives the bytes to a block, which the caller is to release. Null without memory: they stay here then.
	MessageBytes* Share();

	const uint8* Bytes() const { return fBytes.get(); }
	size_t Size() const { return fSize; }

private:
	struct Free {
		void operator()(uint8* bytes) const;
	};

	status_t ReadUpTo(size_t size, size_t enough);
	bool HasBytes(size_t count) const;

	BDataIO* fStream;
	BPositionIO* fPositionStream;
	std::unique_ptr<uint8, Free> fBytes;
	size_t fSize;
	size_t fCapacity;
};


/// Fill() with one whole message of the format whose first word is there already. B_BAD_VALUE when it
/// is cut off or damaged beyond finding its end; other damage is left for the parser.
status_t FillHaiku(MessageStream* input);
status_t FillR5(MessageStream* input);

/// Writes everything, or gives the stream's error.
status_t WriteFully(BDataIO* stream, const void* buffer, size_t size);

#endif // _MESSAGE_STREAM_H
