// The clip's identity: the four routes in their order, and the digest's
// samples of the file, which make the identity independent of the folder.
#include <string>
#include <tuple>
#include <vector>

#include "ClipTest.h"
#include "boundary/OrloConstants.h"
#include "clipmodel/MobIDFromMetadata.h"
#include "identity/GetMobIDFromString.h"

namespace {

using OrloReader::Movie;

const unsigned char kHead[16] = {0x06, 0x0A, 0x2B, 0x34, 0x01, 0x01, 0x01, 0x01,
                                 0x01, 0x01, 0x0F, 0x00, 0x13, 0x00, 0x00, 0x00};

std::string Head(const _aafMobID_t& id) { return std::string(reinterpret_cast<const char*>(&id), 16); }
std::string Material(const _aafMobID_t& id) { return std::string(reinterpret_cast<const char*>(&id.material), 16); }
std::string HeadBytes() { return std::string(reinterpret_cast<const char*>(kHead), 16); }
// The material's three numbers and the instance bytes, high then low.
auto Numbers(const _aafMobID_t& id) {
    return std::make_tuple(id.material.Data1, id.material.Data2, id.material.Data3, id.instanceHigh, id.instanceLow);
}
// A `umid` chunk whose material is sixteen 0x42 bytes.
const std::string kUmidChunk = std::string(3, '\x01') + std::string(16, '\x42') + std::string(5, '\0');

// A SMPTE UMID as a recorder writes it: label, length, instance, and a
// material number whose fields are big-endian.
std::string BextUmid() {
    std::string umid = HeadBytes();
    umid[13] = 0x11;  // instance high
    umid[15] = 0x33;  // instance low
    const unsigned char material[16] = {0x01, 0x02, 0x03, 0x04, 0x05, 0x06, 0x07, 0x08,
                                        0x09, 0x0A, 0x0B, 0x0C, 0x0D, 0x0E, 0x0F, 0x10};
    umid.append(reinterpret_cast<const char*>(material), 16);
    return umid + std::string(32, '\x55');
}

using MobID = ClipFixture;
using HashBuffer = ClipFixture;

TEST_F(MobID, RoutesAreTriedInOrderOfTrust) {
    const std::string fileUid = "RCD2024051713451000000001ABCDEFGHIJK";  // 36 characters
    ClipFile file;
    file.bext = BextWith("");
    file.bext->umid = BextUmid();
    file.umid = kUmidChunk;
    file.ixml = Ixml("<FILE_UID>" + fileUid + "</FILE_UID>");

    // bext first while the iXML toggle is off. The digits are read back as
    // numbers, then each field's bytes are turned around.
    _aafMobID_t id = LoadFile(file).GetMobID();
    EXPECT_EQ(Numbers(id), std::make_tuple(0x04030201u, 0x0605u, 0x0807u, 0x33u, 0x11u));
    EXPECT_EQ(id.material.Data4[7], 0x10);
    EXPECT_EQ(std::string(reinterpret_cast<const char*>(&id), 12), HeadBytes().substr(0, 12));
    // ... unless the toggle says they are big-endian already.
    SetToggle(toggle_BigEndianSmpteIdInBEXTData, 1);
    EXPECT_EQ(Numbers(LoadFile(file).GetMobID()), std::make_tuple(0x01020304u, 0x0506u, 0x0708u, 0x11u, 0x33u));

    // The iXML route takes the first 32 characters themselves as the 32 bytes.
    SetToggle(toggle_MobIDFromiXML, 1);
    id = LoadFile(file).GetMobID();
    EXPECT_EQ(std::string(reinterpret_cast<const char*>(&id), 32), fileUid.substr(0, 32));

    // 31 characters are too few: back to bext.
    file.ixml = Ixml("<FILE_UID>" + fileUid.substr(0, 31) + "</FILE_UID>");
    EXPECT_EQ(LoadFile(file).GetMobID().material.Data1, 0x01020304u);

    // Zero first 32 bytes, the rest not: the 64 are compared as a whole, so the
    // route runs, finds a zero material and fails, leaving its zero head behind.
    file.bext->umid = std::string(32, '\0') + std::string(32, '\x7F');
    id = LoadFile(file).GetMobID();
    EXPECT_EQ(Material(id), std::string(16, '\x42'));
    EXPECT_EQ(Head(id), std::string(16, '\0'));

    // Version 0 has no UMID, whatever the bytes say: the umid chunk is next.
    file.bext->umid = BextUmid();
    file.bext->version = 0;
    id = LoadFile(file).GetMobID();
    EXPECT_EQ(Material(id), std::string(16, '\x42'));
    EXPECT_EQ(Head(id), HeadBytes());
}

TEST_F(MobID, DigestFollowsContentAndNameNotFolder) {
    const std::string bytes = ClipFile{}.Bytes();
    Movie first, moved, renamed;
    ASSERT_EQ(Load(Write("day1/take.wav", bytes), first), TOV_OK);
    ASSERT_EQ(Load(Write("day2/take.wav", bytes), moved), TOV_OK);
    ASSERT_EQ(Load(Write("day1/other.wav", bytes), renamed), TOV_OK);
    EXPECT_EQ(Head(first.GetMobID()), HeadBytes());
    EXPECT_TRUE(OrloReader::IsMobIdMaterialValid(first.GetMobID().material));
    EXPECT_EQ(first.GetMobID(), moved.GetMobID());
    EXPECT_NE(first.GetMobID(), renamed.GetMobID());
}

TEST_F(HashBuffer, BlockSizesAndPlaces) {
    const struct { size_t size, block; } cases[] = {{200, 64}, {191, 64}, {12288, 4032}, {12289, 4096}};
    for (const auto& c : cases) {
        std::string bytes(c.size, '\0');
        for (size_t i = 0; i < c.size; ++i) bytes[i] = static_cast<char>(i % 251);
        const std::string name = "f" + std::to_string(c.size) + ".raw";
        std::vector<unsigned char> buffer;
        ASSERT_TRUE(OrloReader::GetBufferForHash(Write(name, bytes), buffer)) << c.size;
        ASSERT_EQ(buffer.size(), 3 * c.block + name.size()) << c.size;
        const long long middle = static_cast<long long>(c.block) + static_cast<long long>(c.size / 2) -
                                 static_cast<long long>(3 * c.block / 2);
        const std::string got(buffer.begin(), buffer.end());
        EXPECT_EQ(got.substr(0, c.block), bytes.substr(0, c.block)) << c.size;
        EXPECT_EQ(got.substr(c.block, c.block), bytes.substr(static_cast<size_t>(middle), c.block)) << c.size;
        EXPECT_EQ(got.substr(2 * c.block, c.block), bytes.substr(c.size - c.block)) << c.size;
        EXPECT_EQ(got.substr(3 * c.block), name) << c.size;
    }
    std::vector<unsigned char> buffer{1, 2, 3};
    EXPECT_FALSE(OrloReader::GetBufferForHash(Write("tiny", std::string(63, 'x')), buffer));
    EXPECT_TRUE(buffer.empty());
    EXPECT_FALSE(OrloReader::GetBufferForHash(folder + "/missing", buffer));
    EXPECT_FALSE(OrloReader::GetBufferForHash("", buffer));
}

TEST(MobIdMaterial, IsValidOnlyWithEveryFieldSet) {
    const _aafUID_t cases[] = {{0, 2, 3, {1}}, {1, 0, 3, {1}}, {1, 2, 0, {1}}, {1, 2, 3, {}}};
    EXPECT_TRUE(OrloReader::IsMobIdMaterialValid(_aafUID_t{1, 2, 3, {0, 0, 0, 0, 0, 0, 0, 1}}));
    for (const _aafUID_t& uid : cases) EXPECT_FALSE(OrloReader::IsMobIdMaterialValid(uid)) << uid.Data1;
}

TEST_F(MobID, AFileTooSmallToDigestHasNone) {
    // fmt and an empty data chunk: 44 bytes, below one 64-byte block.
    ClipFile file;
    file.frames = 0;
    Movie movie;
    EXPECT_EQ(Load(Write("empty.wav", file.Bytes()), movie), TOV_E_NOTSUPPORTED);
    // The same with a umid chunk takes its identity from there.
    file.umid = kUmidChunk;
    EXPECT_EQ(Load(Write("umid.wav", file.Bytes()), movie), TOV_OK);
}

}  // namespace
