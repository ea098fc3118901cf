// SPDX-License-Identifier: MIT
// All that is left in a stream.
#ifndef KITS_TRANSLATION_STREAM_BYTES_H
#define KITS_TRANSLATION_STREAM_BYTES_H

#include <vector>

#include <DataIO.h>

namespace BPrivate {

/// Reads from the present position to the end. Returns B_OK; the stream's error; B_NO_MEMORY for more
/// than 256 MB.
inline status_t
ReadToEnd(BPositionIO* stream, std::vector<uint8>* bytes)
{
	constexpr size_t kPiece = 65536;
	constexpr size_t kMost = 256 * 1024 * 1024;
	bytes->clear();
	while (true) {
		const size_t before = bytes->size();
		if (before > kMost)
			return B_NO_MEMORY;
		bytes->resize(before + kPiece);
		const ssize_t read = stream->Read(bytes->data() + before, kPiece);
		bytes->resize(before + static_cast<size_t>(read > 0 ? read : 0));
		if (read <= 0)
			return read < 0 ? static_cast<status_t>(read) : B_OK;
	}
}

} // namespace BPrivate

#endif // KITS_TRANSLATION_STREAM_BYTES_H
