// SPDX-License-Identifier: MIT
// One colour put onto pixels by their coverage.
#include "display/qt/CoverPixels.h"

#include <cstring>

#ifdef __SSE2__
#include <emmintrin.h>
#endif

#include "display/qt/Blend.h"

namespace BPrivate {

namespace {

const uint32 kOpaque = 0xff000000;

#ifdef __SSE2__

/// What MixPixels() does, to the four channels of two pixels at a time.
__m128i
MixTwo(__m128i below, __m128i color, __m128i amount)
{
	const __m128i rest = _mm_sub_epi16(_mm_set1_epi16(255), amount);
	__m128i sum = _mm_add_epi16(_mm_mullo_epi16(below, rest), _mm_mullo_epi16(color, amount));
	sum = _mm_add_epi16(sum, _mm_set1_epi16(128));
	return _mm_srli_epi16(_mm_add_epi16(sum, _mm_srli_epi16(sum, 8)), 8);
}


/// Four pixels at a time; returns how many are done.
int
CoverFours(uint32* pixels, const uint8* coverage, int count, uint32 pixel, uint32 opaque)
{
	const __m128i zero = _mm_setzero_si128();
	const __m128i color = _mm_unpacklo_epi8(_mm_set1_epi32(static_cast<int>(pixel)), zero);
	const __m128i alpha = _mm_set1_epi32(static_cast<int>(opaque));
	int done = 0;
	for (; done + 4 <= count; done += 4) {
		int four;
		memcpy(&four, coverage + done, sizeof(four));
		if (four == 0)
			continue;
		// The coverage of each pixel for each of its channels.
		__m128i amounts = _mm_cvtsi32_si128(four);
		amounts = _mm_unpacklo_epi8(amounts, amounts);
		amounts = _mm_unpacklo_epi16(amounts, amounts);

		__m128i* place = reinterpret_cast<__m128i*>(pixels + done);
		const __m128i below = _mm_loadu_si128(place);
		const __m128i mixed = _mm_packus_epi16(
			MixTwo(_mm_unpacklo_epi8(below, zero), color, _mm_unpacklo_epi8(amounts, zero)),
			MixTwo(_mm_unpackhi_epi8(below, zero), color, _mm_unpackhi_epi8(amounts, zero)));
		const __m128i isBare = _mm_cmpeq_epi8(amounts, zero);
		_mm_storeu_si128(place, _mm_or_si128(mixed, _mm_andnot_si128(isBare, alpha)));
	}
	return done;
}

#else

int
CoverFours(uint32*, const uint8*, int, uint32, uint32)
{
	return 0;
}

#endif

} // namespace


void
CoverPixels(uint32* pixels, const uint8* coverage, int count, uint32 pixel, bool hasAlpha)
{
	const uint32 opaque = hasAlpha ? 0 : kOpaque;
	for (int i = CoverFours(pixels, coverage, count, pixel, opaque); i < count; i++) {
		if (coverage[i] != 0)
			pixels[i] = MixPixels(pixels[i], pixel, coverage[i]) | opaque;
	}
}

} // namespace BPrivate
