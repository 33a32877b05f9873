#include "ExampleIxml.h"

namespace ExampleIxml {

std::string Speed(uint64_t samplesSinceMidnight) {
    return "  <SPEED>\n"
           "    <MASTER_SPEED>25/1</MASTER_SPEED>\n"
           "    <CURRENT_SPEED>25/1</CURRENT_SPEED>\n"
           "    <TIMECODE_RATE>25/1</TIMECODE_RATE>\n"
           "    <TIMECODE_FLAG>NDF</TIMECODE_FLAG>\n"
           "    <FILE_SAMPLE_RATE>48000</FILE_SAMPLE_RATE>\n"
           "    <AUDIO_BIT_DEPTH>24</AUDIO_BIT_DEPTH>\n"
           "    <DIGITIZER_SAMPLE_RATE>48000</DIGITIZER_SAMPLE_RATE>\n"
           "    <TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_HI>0</TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_HI>\n"
           "    <TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_LO>" +
           std::to_string(samplesSinceMidnight) +
           "</TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_LO>\n"
           "    <TIMESTAMP_SAMPLE_RATE>48000</TIMESTAMP_SAMPLE_RATE>\n"
           "  </SPEED>\n";
}

std::string Track(int channelIndex, int interleaveIndex, const std::string& name) {
    return "    <TRACK>\n"
           "      <CHANNEL_INDEX>" +
           std::to_string(channelIndex) +
           "</CHANNEL_INDEX>\n"
           "      <INTERLEAVE_INDEX>" +
           std::to_string(interleaveIndex) +
           "</INTERLEAVE_INDEX>\n"
           "      <NAME>" +
           name +
           "</NAME>\n"
           "      <FUNCTION>M</FUNCTION>\n"
           "    </TRACK>\n";
}

}  // namespace ExampleIxml
