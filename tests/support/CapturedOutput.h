// SPDX-License-Identifier: MIT
// What the code under test prints.
#ifndef TESTS_SUPPORT_CAPTURED_OUTPUT_H
#define TESTS_SUPPORT_CAPTURED_OUTPUT_H

#include <string>

#include <gtest/gtest.h>

/// Collects standard output from its construction to Text(), or to its end.
class CapturedOutput {
public:
	CapturedOutput() { testing::internal::CaptureStdout(); }

	~CapturedOutput()
	{
		if (fRunning)
			testing::internal::GetCapturedStdout();
	}

	/// What was printed; ends the collecting. Once only.
	std::string Text()
	{
		fRunning = false;
		return testing::internal::GetCapturedStdout();
	}

private:
	bool fRunning = true;
};

#endif // TESTS_SUPPORT_CAPTURED_OUTPUT_H
