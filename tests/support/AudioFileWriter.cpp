#include "AudioFileWriter.h"

#include "Bytes.h"

AudioFileWriter::AudioFileWriter(Frame frame, const std::string& formType) : m_Frame(frame), m_FormType(formType) {}

AudioFileWriter& AudioFileWriter::Chunk(const std::string& id, const std::string& payload) {
    return ChunkWithSize(id, static_cast<uint32_t>(payload.size()), payload, payload.size() % 2 == 1);
}

AudioFileWriter& AudioFileWriter::ChunkWithSize(const std::string& id, uint32_t size, const std::string& payload,
                                                bool pad) {
    m_Body += Bytes::Fixed(id, 4) + SizeField(size) + payload;
    if (pad) m_Body += '\0';
    return *this;
}

AudioFileWriter& AudioFileWriter::Raw(const std::string& bytes) {
    m_Body += bytes;
    return *this;
}

std::string AudioFileWriter::SizeField(uint32_t size) const {
    return m_Frame == Frame::FORM ? Bytes::BE32(size) : Bytes::LE32(size);
}

std::string AudioFileWriter::Bytes() const {
    static const char* const kOuter[] = {"RIFF", "RF64", "FORM"};
    const std::string form = Bytes::Fixed(m_FormType, 4);
    const uint32_t size = m_Frame == Frame::RF64 ? 0xFFFFFFFFu : static_cast<uint32_t>(form.size() + m_Body.size());
    return kOuter[static_cast<int>(m_Frame)] + SizeField(size) + form + m_Body;
}
