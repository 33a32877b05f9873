// Equality and null tests must look at every byte of an identifier.
#include <gtest/gtest.h>

#include <cstring>

#include "identity/IDComparison.h"

namespace {

using namespace ZEB::AAFUtils;

template <class ID>
ID WithByteSet(std::size_t index) {
    ID id{};
    reinterpret_cast<unsigned char*>(&id)[index] = 0x01;
    return id;
}

TEST(IDComparison, UIDsDifferingInAnyByteAreUnequalAndNotNull) {
    EXPECT_TRUE(IsNullUID(UID_NULL));
    EXPECT_TRUE(IsEqualUID(UID_NULL, _aafUID_t{}));
    for (std::size_t i = 0; i < sizeof(_aafUID_t); ++i) {
        const _aafUID_t id = WithByteSet<_aafUID_t>(i);
        EXPECT_FALSE(IsNullUID(id)) << "byte " << i;
        EXPECT_FALSE(IsEqualUID(id, UID_NULL)) << "byte " << i;
        EXPECT_TRUE(IsEqualUID(id, WithByteSet<_aafUID_t>(i))) << "byte " << i;
    }
}

TEST(IDComparison, MobIDsDifferingInAnyByteAreUnequalAndNotNull) {
    EXPECT_TRUE(IsNullMobID(MOBID_NULL));
    for (std::size_t i = 0; i < sizeof(_aafMobID_t); ++i) {
        const _aafMobID_t id = WithByteSet<_aafMobID_t>(i);
        EXPECT_FALSE(IsNullMobID(id)) << "byte " << i;
        EXPECT_FALSE(IsEqualMobID(id, MOBID_NULL)) << "byte " << i;
        EXPECT_TRUE(IsEqualMobID(id, WithByteSet<_aafMobID_t>(i))) << "byte " << i;
    }
}

}  // namespace
