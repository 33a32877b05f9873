#include "GoldenDump.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <fstream>
#include <sstream>

namespace aaftest {

void ExpectMatchesGolden(const std::string& dump, const std::string& path) {
    if (std::getenv("ORLO_UPDATE_GOLDEN")) std::ofstream(path) << dump;
    std::ifstream in(path);
    ASSERT_TRUE(in) << "missing golden file " << path;
    std::stringstream golden;
    golden << in.rdbuf();
    EXPECT_EQ(dump, golden.str()) << "dump differs from " << path;
}

}  // namespace aaftest
