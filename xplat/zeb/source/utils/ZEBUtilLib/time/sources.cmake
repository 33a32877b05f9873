# Time helpers: timecode rates and frame counts, the longest clip, and AAF
# time stamps from and to text.
target_sources(ZEBUtilLib PRIVATE
    ${CMAKE_CURRENT_LIST_DIR}/ConvertTCToFrames.cpp
    ${CMAKE_CURRENT_LIST_DIR}/ConvertTime.cpp
    ${CMAKE_CURRENT_LIST_DIR}/GetMaxDuration.cpp
    ${CMAKE_CURRENT_LIST_DIR}/TCFrameRates.cpp
    ${CMAKE_CURRENT_LIST_DIR}/TimeStampPlaces.cpp
    ${CMAKE_CURRENT_LIST_DIR}/TimeStampText.cpp)
