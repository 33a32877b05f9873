# Channel grouping: the group scan, the numbered-suffix and channel-label
# schemes, and their helpers.
target_sources(OrloPlugin PRIVATE
    ${CMAKE_CURRENT_LIST_DIR}/AreZEBStringsEqual.cpp
    ${CMAKE_CURRENT_LIST_DIR}/ConvertAlphaIndexToNumber.cpp
    ${CMAKE_CURRENT_LIST_DIR}/FindAndParseFilesForGrouping.cpp
    ${CMAKE_CURRENT_LIST_DIR}/GetFileExtension.cpp
    ${CMAKE_CURRENT_LIST_DIR}/GroupIdentity.cpp
    ${CMAKE_CURRENT_LIST_DIR}/GroupNameFilter.cpp
    ${CMAKE_CURRENT_LIST_DIR}/GroupScan.cpp
    ${CMAKE_CURRENT_LIST_DIR}/TesselFilter.cpp
    ${CMAKE_CURRENT_LIST_DIR}/TesselGrouping.cpp
    ${CMAKE_CURRENT_LIST_DIR}/TesselGroupingInfo.cpp
    ${CMAKE_CURRENT_LIST_DIR}/TrackIndexFromFileName.cpp
    ${CMAKE_CURRENT_LIST_DIR}/TrkComparsion.cpp
    ${CMAKE_CURRENT_LIST_DIR}/UTF8Name.cpp
    ${CMAKE_CURRENT_LIST_DIR}/VTImportFilter.cpp
    ${CMAKE_CURRENT_LIST_DIR}/VTImportGrouping.cpp)
