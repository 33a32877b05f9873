// The iXML chunk as the stream reads it: the two repairs, and refusal of an empty chunk.
#include <gtest/gtest.h>

#include "AudioFileWriter.h"
#include "ChunkPayloads.h"
#include "ReaderTest.h"
#include "reader/ixml/IXMLChunk.h"

namespace {

using Chunks::IXML::IXMLChunk;

class IxmlChunk : public ReaderFixture {
protected:
    // A stereo WAVE whose iXML chunk carries `xml`.
    std::string Wave(const std::string& xml) {
        return AudioFileWriter::Wave()
            .Chunk("fmt ", Payload::FmtChunk({}))
            .Chunk("iXML", xml)
            .Chunk("data", std::string(12, '\0'))
            .Bytes();
    }
};

struct Repair {
    const char* name;
    std::string written, read;
};

TEST_F(IxmlChunk, TextIsMendedBeforeAnyoneParsesIt) {
    const Repair cases[] = {
        {"as written", "<BWFXML><SCENE>1</SCENE></BWFXML>", "<BWFXML><SCENE>1</SCENE></BWFXML>"},
        {"padding behind the root", std::string("<BWFXML/>") + std::string(37, '\0'), "<BWFXML/>"},
        {"spaces and a line feed behind the root", "<BWFXML/>  \r\n  ", "<BWFXML/>"},
        {"misspelled declaration", "<?xml version=\"1.0\" encording=\"UTF-8\"?><BWFXML/>",
         "<?xml version=\"1.0\" encoding=\"UTF-8\"?><BWFXML/>"},
        {"only the first misspelling", "<?xml encording=\"UTF-8\"?><BWFXML><NOTE>encording</NOTE></BWFXML>",
         "<?xml encoding=\"UTF-8\"?><BWFXML><NOTE>encording</NOTE></BWFXML>"},
        {"odd size gains its pad byte, then loses it", "<BWFXML/>", "<BWFXML/>"},
        {"even text without markup kept whole", "no markup.", "no markup."},
    };
    for (const Repair& c : cases) {
        auto stream = Open(Wave(c.written));
        ASSERT_EQ(stream->GetError(), nullptr) << c.name;
        ASSERT_TRUE(stream->HasChunk(Orlo::OrloStream::IXML_CHUNK)) << c.name;
        EXPECT_EQ(stream->GetChunk<IXMLChunk>()->GetRawXml(), c.read) << c.name;
    }
}

TEST_F(IxmlChunk, AnEmptyChunkIsAsIfItWereNotThere) {
    auto stream = Open(Wave(""));
    ASSERT_EQ(stream->GetError(), nullptr);
    EXPECT_FALSE(stream->HasChunk(Orlo::OrloStream::IXML_CHUNK));
    EXPECT_EQ(stream->GetSampleCount(), 2u) << "the walk goes on behind it";
}

TEST_F(IxmlChunk, ATruncatedChunkFailsTheStream) {
    const std::string file = AudioFileWriter::Wave()
                                 .Chunk("fmt ", Payload::FmtChunk({}))
                                 .ChunkWithSize("iXML", 4096, "<BWFXML>", false)
                                 .Bytes();
    EXPECT_EQ(ErrorOf(file), "Unknown C++ exception");
}

}  // namespace
