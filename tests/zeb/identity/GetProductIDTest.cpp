// The product identification: the caller's values in place, the platform text
// as recorded, and the version record shared by every call.
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "identity/GetProductID.h"

namespace {

constexpr _tovUID kProductID = {0x3711D3CC, 0x62D0, 0x49D7, {0xB0, 0xAE, 0xC1, 0x18, 0x10, 0x1D, 0x1A, 0x16}};

TEST(GetProductID, FillsTheRecordAndEveryCallRewritesTheOneVersionRecord) {
    const wchar_t *company = L"a", *product = L"b", *version = L"c";
    _aafProductIdentification_t id{}, later{};
    ZEB::GetProductID(id, 1, 9, 1, 10178, company, product, version, kProductID);
    EXPECT_EQ(id.companyName, company);
    EXPECT_EQ(id.productName, product);
    EXPECT_EQ(id.productVersionString, version);
    EXPECT_EQ(std::wstring(id.platform), L"MacOS X");
    const _aafUID_t expected = {0x3711D3CC, 0x62D0, 0x49D7, {0xB0, 0xAE, 0xC1, 0x18, 0x10, 0x1D, 0x1A, 0x16}};
    EXPECT_EQ(id.productID, expected);
    ASSERT_NE(id.productVersion, nullptr);
    const aafProductVersion_t& v = *id.productVersion;
    EXPECT_EQ((std::vector<int>{v.major, v.minor, v.tertiary, v.patchLevel, v.type}),
              (std::vector<int>{1, 9, 1, 10178, kAAFVersionUnknown}));

    ZEB::GetProductID(later, 5, 6, 7, 8, company, product, version, kProductID);
    EXPECT_EQ(id.productVersion, later.productVersion);
    EXPECT_EQ(id.platform, later.platform);
    EXPECT_EQ(v.major, 5) << "the earlier record sees the later numbers";
}

}  // namespace
