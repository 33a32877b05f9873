# Channel grouping: the numbered-suffix and channel-label schemes and their
# helpers.
target_sources(OrloPlugin PRIVATE
    ${CMAKE_CURRENT_LIST_DIR}/ConvertAlphaIndexToNumber.cpp
    ${CMAKE_CURRENT_LIST_DIR}/TrackIndexFromFileName.cpp
    ${CMAKE_CURRENT_LIST_DIR}/TrkComparsion.cpp)
