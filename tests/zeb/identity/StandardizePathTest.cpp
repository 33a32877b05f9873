// The in-place path standardising: same string object, wide encoding, slashes.
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "IdentityFixture.h"
#include "identity/StandardizePath.h"

namespace {

using namespace ZEB;

class StandardizePathInPlace : public IdentityFixture {};

TEST_F(StandardizePathInPlace, RewritesBackslashesInTheStringItself) {
    struct Case {
        const char* path;
        std::wstring expected;
    };
    const std::vector<Case> cases = {
        {"\\\\server\\share\\", L"//server/share/"}, {"caf\xC3\xA9\\\xE2\x82\xAC", L"caf\u00E9/\u20AC"}, {"", L""}};
    for (const auto& c : cases) {
        ZEBString path(reinterpret_cast<const unsigned char*>(c.path));
        ITOVString* before = path.InArg();
        AAFUtils::StandardizePath(path);
        EXPECT_EQ(path.InArg(), before) << c.path;
        EXPECT_EQ(path.GetUnicodeType(), kTOVUnicodeWCHAR) << c.path;
        EXPECT_EQ(std::wstring(path.GetWCHARString()), c.expected) << c.path;
    }
}

}  // namespace
