# The audio file reader: the chunk stream, its parsers and their file helpers;
# in ixml/ the iXML chunk, its text parsers and the document read.
target_sources(OrloPlugin PRIVATE
    ${CMAKE_CURRENT_LIST_DIR}/BEXTChunk.cpp
    ${CMAKE_CURRENT_LIST_DIR}/COMMChunk.cpp
    ${CMAKE_CURRENT_LIST_DIR}/CalcBytesRemaining.cpp
    ${CMAKE_CURRENT_LIST_DIR}/ConvertStrToChunkType.cpp
    ${CMAKE_CURRENT_LIST_DIR}/DATAChunk.cpp
    ${CMAKE_CURRENT_LIST_DIR}/DS64Chunk.cpp
    ${CMAKE_CURRENT_LIST_DIR}/ExtendedFloat.cpp
    ${CMAKE_CURRENT_LIST_DIR}/FMTChunk.cpp
    ${CMAKE_CURRENT_LIST_DIR}/OpenForWalk.cpp
    ${CMAKE_CURRENT_LIST_DIR}/OrloStream.cpp
    ${CMAKE_CURRENT_LIST_DIR}/ParseOriginationTime.cpp
    ${CMAKE_CURRENT_LIST_DIR}/PerformAdditionalInitialization.cpp
    ${CMAKE_CURRENT_LIST_DIR}/ReadBytes.cpp
    ${CMAKE_CURRENT_LIST_DIR}/SSNDChunk.cpp
    ${CMAKE_CURRENT_LIST_DIR}/SplitString.cpp
    ${CMAKE_CURRENT_LIST_DIR}/UMIDChunk.cpp
    ${CMAKE_CURRENT_LIST_DIR}/int24.cpp
    ${CMAKE_CURRENT_LIST_DIR}/ixml/IXMLChunk.cpp
    ${CMAKE_CURRENT_LIST_DIR}/ixml/IXMLTextParsers.cpp
    ${CMAKE_CURRENT_LIST_DIR}/ixml/ParceRawIXML.cpp)
