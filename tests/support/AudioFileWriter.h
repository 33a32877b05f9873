#pragma once
/// Lays out any sequence of chunks in a RIFF, RF64 or FORM frame, malformed
/// ones included (odd sizes without pad bytes, sizes that lie, duplicates,
/// wrong order), so that tests make their fixtures as bytes at run time.
#include <cstdint>
#include <string>

class AudioFileWriter {
public:
    enum class Frame { RIFF, RF64, FORM };

    /// `formType`: "WAVE", "AIFF", "AIFC", or anything else for failure cases.
    AudioFileWriter(Frame frame, const std::string& formType);
    /// "RIFF" … "WAVE", "RF64" … "WAVE", "FORM" … "AIFF" or "FORM" … "AIFC".
    static AudioFileWriter Wave() { return AudioFileWriter(Frame::RIFF, "WAVE"); }
    static AudioFileWriter RF64() { return AudioFileWriter(Frame::RF64, "WAVE"); }
    static AudioFileWriter Aiff() { return AudioFileWriter(Frame::FORM, "AIFF"); }
    static AudioFileWriter Aifc() { return AudioFileWriter(Frame::FORM, "AIFC"); }

    /// A well-formed chunk: size field = payload size, a pad byte when odd.
    AudioFileWriter& Chunk(const std::string& id, const std::string& payload);
    /// A chunk whose size field says `size` whatever the payload holds, with or
    /// without a pad byte behind the payload.
    AudioFileWriter& ChunkWithSize(const std::string& id, uint32_t size, const std::string& payload, bool pad);
    /// Bytes as they stand, after the chunks so far.
    AudioFileWriter& Raw(const std::string& bytes);

    /// The whole file. The outer size field is the true size less 8, or
    /// 0xFFFFFFFF in an RF64 frame, as RF64 writers leave it.
    std::string Bytes() const;
    /// A 32-bit chunk size field in the frame's byte order.
    std::string SizeField(uint32_t size) const;

private:
    Frame m_Frame;
    std::string m_FormType;
    std::string m_Body;
};
