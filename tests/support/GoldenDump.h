#pragma once
/// A dump compared with its golden file. With ORLO_UPDATE_GOLDEN set in the
/// environment the file is first written from the dump, to regenerate it.
#include <string>

namespace aaftest {

/// A test failure when `dump` differs from the file at `path`, or there is none.
void ExpectMatchesGolden(const std::string& dump, const std::string& path);

}  // namespace aaftest
