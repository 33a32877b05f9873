#pragma once
/// Element names and value literals of the iXML vocabulary that the reader uses.
namespace Chunks {
namespace IXML {
namespace IXMLElements {

inline constexpr char PROJECT[] = "PROJECT";
inline constexpr char SCENE[] = "SCENE";
inline constexpr char TAKE[] = "TAKE";
inline constexpr char UBITS[] = "UBITS";
inline constexpr char TAPE[] = "TAPE";
inline constexpr char NOTE[] = "NOTE";
inline constexpr char USER[] = "USER";
inline constexpr char FILE_UID[] = "FILE_UID";
inline constexpr char CIRCLED[] = "CIRCLED";
inline constexpr char NO_GOOD[] = "NO_GOOD";
inline constexpr char FALSE_START[] = "FALSE_START";
inline constexpr char WILD_TRACK[] = "WILD_TRACK";
inline constexpr char IXML_VERSION[] = "IXML_VERSION";
inline constexpr char SPEED[] = "SPEED";
inline constexpr char TIMECODE_RATE[] = "TIMECODE_RATE";
inline constexpr char TIMECODE_FLAG[] = "TIMECODE_FLAG";
inline constexpr char TIMESTAMP_SAMPLE_RATE[] = "TIMESTAMP_SAMPLE_RATE";
inline constexpr char TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_HI[] = "TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_HI";
inline constexpr char TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_LO[] = "TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_LO";
inline constexpr char DIGITIZER_SAMPLE_RATE[] = "DIGITIZER_SAMPLE_RATE";
inline constexpr char TRACK_LIST[] = "TRACK_LIST";
inline constexpr char TRACK_COUNT[] = "TRACK_COUNT";
inline constexpr char TRACK[] = "TRACK";
inline constexpr char NAME[] = "NAME";
inline constexpr char CHANNEL_INDEX[] = "CHANNEL_INDEX";
inline constexpr char INTERLEAVE_INDEX[] = "INTERLEAVE_INDEX";

inline constexpr char ELEM_VALUE_TRUE[] = "TRUE";
inline constexpr char ELEM_VALUE_FALSE[] = "FALSE";
inline constexpr char TIMECODE_FLAG_VALUE_DROP[] = "DF";
inline constexpr char TIMECODE_FLAG_VALUE_NONDROP[] = "NDF";

}  // namespace IXMLElements
}  // namespace IXML
}  // namespace Chunks
