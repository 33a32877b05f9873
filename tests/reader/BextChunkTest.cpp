// The bext chunk: its versions, the Description keywords, and the umid chunk.
#include "AudioFileWriter.h"
#include "Bytes.h"
#include "ChunkPayloads.h"
#include "ReaderTest.h"
#include "reader/BEXTChunk.h"
#include "reader/UMIDChunk.h"

namespace {

using Keywords = std::map<std::string, std::string>;
using Orlo::OrloStream;

std::string BroadcastWave(const Payload::Bext& bext) {
    Payload::Fmt fmt;
    return AudioFileWriter::Wave()
        .Chunk("bext", Payload::BextChunk(bext))
        .Chunk("fmt ", Payload::FmtChunk(fmt))
        .Chunk("data", std::string(12, '\0'))
        .Bytes();
}

class BextChunk : public ReaderFixture {
protected:
    std::shared_ptr<Chunks::BEXT::BEXTChunk> Read(const Payload::Bext& bext) {
        m_Stream = Open(BroadcastWave(bext));
        EXPECT_EQ(m_Stream->GetError(), nullptr);
        EXPECT_TRUE(m_Stream->HasChunk(OrloStream::BEXT_CHUNK));
        return m_Stream->GetChunk<Chunks::BEXT::BEXTChunk>();
    }
    Keywords KeywordsOf(const std::string& description) {
        Payload::Bext bext;
        bext.description = description;
        return Read(bext)->GetParsedDescriptionField();
    }
    std::unique_ptr<OrloStream> m_Stream;
};

TEST_F(BextChunk, DescriptionKeywords) {
    const struct {
        std::string description;
        Keywords keywords;
    } rows[] = {
        {"sSCENE=12A\r\nsTAKE=3\r\n", {{"SCENE", "12A"}, {"TAKE", "3"}}},
        {"sNOTE=say \"hello\" twice\n", {{"NOTE", "say hello twice"}}},
        // The first character is a type mark and always dropped.
        {"SCENE=4\n", {{"CENE", "4"}}},
        {"=A\r\n", {{"", "A"}}},
        {"x\nsTAPE=7\n", {{"TAPE", "7"}}},
        {"no equals sign here\r\n", {}},
        // Zero bytes end pieces like line breaks do; a later key wins.
        {std::string("sTAKE=1\0sTAKE=2\0", 16), {{"TAKE", "2"}}},
        // Keys keep their case; the value runs to the end of the piece.
        {"sScene=a=b\r", {{"Scene", "a=b"}}},
        {"", {}},
        {"free text written by a person", {}},
    };
    for (const auto& row : rows) EXPECT_EQ(KeywordsOf(row.description), row.keywords) << row.description;
}

TEST_F(BextChunk, VersionsDecideUmidLoudnessAndHistory) {
    for (uint16_t version : {0, 1, 2, 3}) {
        SCOPED_TRACE(version);
        Payload::Bext bext;
        bext.version = version;
        bext.originatorReference = "REF123";
        bext.timeReference = 0x123456789ull;
        bext.umid = std::string(32, '\x06') + std::string(32, '\x07');
        bext.loudness[0] = -2300;
        bext.loudness[4] = 150;
        bext.codingHistory = "A=PCM";  // odd: the pad byte behind it is kept
        const auto chunk = Read(bext);
        EXPECT_EQ(chunk->GetVersion(), version);
        EXPECT_EQ(chunk->GetTimeReference(), 0x123456789ull);
        EXPECT_EQ(chunk->GetOriginator(), Bytes::Fixed("Orlo tests", 32));
        EXPECT_EQ(chunk->GetOriginatorReference(), Bytes::Fixed("REF123", 32));
        EXPECT_EQ(chunk->GetOriginationDate(), "2024-05-17");
        EXPECT_EQ(chunk->GetOriginationTime(), "13:45:10");
        EXPECT_EQ(chunk->GetDescription().size(), 256u);
        const bool hasUmid = version == 1 || version == 2;
        EXPECT_EQ(std::string(reinterpret_cast<const char*>(chunk->GetUMID()), 64),
                  hasUmid ? bext.umid : std::string(64, '\0'));
        EXPECT_EQ(chunk->GetLoudness().loudnessValue, version == 2 ? -2300 : 0);
        EXPECT_EQ(chunk->GetLoudness().maxShortTermLoudness, version == 2 ? 150 : 0);
        // A version from the future keeps all behind offset 348 as history.
        const std::string payload = Payload::BextChunk(bext) + '\0';
        EXPECT_EQ(chunk->GetCodingHistory(), version == 3 ? payload.substr(348) : std::string("A=PCM\0", 6));
    }
}

TEST_F(BextChunk, UnderItsFixedPartIsDropped) {
    auto stream = Open(AudioFileWriter::Wave()
                           .Chunk("bext", Payload::BextChunk(Payload::Bext()).substr(0, 600))
                           .Chunk("fmt ", Payload::FmtChunk(Payload::Fmt()))
                           .Bytes());
    EXPECT_EQ(stream->GetError(), nullptr);
    EXPECT_FALSE(stream->HasChunk(OrloStream::BEXT_CHUNK));
    EXPECT_TRUE(stream->HasChunk(OrloStream::FMT_CHUNK));
}

using UmidChunk = ReaderFixture;

TEST_F(UmidChunk, IsValidWhenAnyByteIsSet) {
    const struct {
        std::string payload;
        bool accepted, valid;
    } rows[] = {{std::string(24, '\0'), true, false},
                {std::string(23, '\0') + "\x01", true, true},
                {std::string(16, '\x01'), false, false}};
    for (const auto& row : rows) {
        auto stream = Open(AudioFileWriter::Wave()
                               .Chunk("fmt ", Payload::FmtChunk(Payload::Fmt()))
                               .Chunk("umid", row.payload)
                               .Bytes());
        ASSERT_EQ(stream->GetError(), nullptr);
        EXPECT_EQ(stream->HasChunk(OrloStream::UMID_CHUNK), row.accepted);
        EXPECT_EQ(stream->GetChunk<Chunks::UMID::UMIDChunk>()->IsValid(), row.valid);
    }
}

// Only 24 bytes of a longer umid are read: the walk goes on inside it, so
// chunk headers there are read as chunks.
TEST_F(UmidChunk, LongerOneIsWalkedIntoAfter24Bytes) {
    const std::string fmt = Payload::FmtChunk(Payload::Fmt());
    const std::string umid = std::string(24, '\x01') + "data" + Bytes::LE32(0);
    auto stream = Open(AudioFileWriter::Wave().Chunk("fmt ", fmt).Chunk("umid", umid).Bytes());
    ASSERT_EQ(stream->GetError(), nullptr);
    ASSERT_TRUE(stream->HasChunk(OrloStream::DATA_CHUNK));
    const int64_t umidPayload = 12 + 8 + static_cast<int64_t>(fmt.size()) + 8;
    EXPECT_EQ(stream->GetStartPosition(), umidPayload + 32);
}

}  // namespace
