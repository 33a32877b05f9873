// A Mob ID's text reads back into the same 32 bytes.
#include <gtest/gtest.h>

#include <cstring>

#include "MobIDText.h"
#include "identity/GetMobIDFromString.h"

namespace {

_aafMobID_t Filled(unsigned char (*byte)(int)) {
    unsigned char bytes[sizeof(_aafMobID_t)];
    for (int i = 0; i < static_cast<int>(sizeof bytes); ++i) bytes[i] = byte(i);
    _aafMobID_t id;
    std::memcpy(&id, bytes, sizeof id);
    return id;
}

TEST(MobIDTextTest, ReadsBackIntoTheSameBytes) {
    const _aafMobID_t ids[] = {
        Filled([](int) -> unsigned char { return 0x00; }),
        Filled([](int) -> unsigned char { return 0xFF; }),
        Filled([](int i) -> unsigned char { return static_cast<unsigned char>(i * 37 + 11); }),
        // The material's fields differ in byte order from their text.
        Filled([](int i) -> unsigned char { return static_cast<unsigned char>(i < 16 ? 0 : i); }),
    };
    for (const _aafMobID_t& id : ids) {
        const std::string text = MobIDText(id);
        ASSERT_EQ(text.size(), 64u);
        EXPECT_EQ(text.find_first_not_of("0123456789ABCDEF"), std::string::npos) << text;
        _aafMobID_t back;
        std::memset(&back, 0x5A, sizeof back);
        ASSERT_EQ(ZEB::GetMobIDFromString(text.c_str(), &back), TOV_OK);
        EXPECT_EQ(std::memcmp(&back, &id, sizeof id), 0) << text;
    }
}

TEST(MobIDTextTest, MaterialNumbersAreWrittenMostSignificantFirst) {
    _aafMobID_t id{};
    id.length = 0x13;
    id.material.Data1 = 0x11223344;
    id.material.Data2 = 0x5566;
    id.material.Data3 = 0x7788;
    id.material.Data4[0] = 0x99;
    EXPECT_EQ(MobIDText(id), "000000000000000000000000" "13000000" "11223344" "5566" "7788" "9900000000000000");
}

}  // namespace
