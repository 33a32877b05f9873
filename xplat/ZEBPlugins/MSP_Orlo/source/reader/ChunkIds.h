#pragma once
/// The identifiers of the chunks that have a parser, as they stand in a file.
/// Each parser keeps its own in its namespace.

namespace Chunks {
namespace DS64 {
inline constexpr char ChunkId[] = "ds64";
}
namespace FMT {
inline constexpr char FMTChunkId[] = "fmt ";
}
namespace DATA {
inline constexpr char DATAChunkId[] = "data";
}
namespace BEXT {
inline constexpr char BEXTChunkId[] = "bext";
}
namespace IXML {
inline constexpr char IXMLChunkId[] = "iXML";
}
namespace UMID {
inline constexpr char UMIDChunkId[] = "umid";
}
namespace COMM {
inline constexpr char COMMChunkId[] = "COMM";
}
namespace SSND {
inline constexpr char SSNDChunkId[] = "SSND";
}
}  // namespace Chunks
