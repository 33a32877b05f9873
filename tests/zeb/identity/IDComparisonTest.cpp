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

// Every one-byte change of `null` is unequal to it, not null, and equal to itself.
template <class ID>
void ExpectEveryByteCounts(const ID& null, bool (*isNull)(const ID&), bool (*isEqual)(const ID&, const ID&)) {
    EXPECT_TRUE(isNull(null));
    EXPECT_TRUE(isEqual(null, ID{}));
    for (std::size_t i = 0; i < sizeof(ID); ++i) {
        const ID id = WithByteSet<ID>(i);
        EXPECT_FALSE(isNull(id)) << "byte " << i;
        EXPECT_FALSE(isEqual(id, null)) << "byte " << i;
        EXPECT_TRUE(isEqual(id, WithByteSet<ID>(i))) << "byte " << i;
    }
}

TEST(IDComparison, IdentifiersDifferingInAnyByteAreUnequalAndNotNull) {
    ExpectEveryByteCounts<_aafUID_t>(UID_NULL, IsNullUID, IsEqualUID);
    ExpectEveryByteCounts<_aafMobID_t>(MOBID_NULL, IsNullMobID, IsEqualMobID);
}

}  // namespace
