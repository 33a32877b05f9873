# The clip model: the Movie and its records, the rules that fill them from the
# chunks, timecode arithmetic, frame rates and text forms.
target_sources(OrloPlugin PRIVATE
    ${CMAKE_CURRENT_LIST_DIR}/AddTimeCodeFromMetadata.cpp
    ${CMAKE_CURRENT_LIST_DIR}/AudioMediaDescriptor.cpp
    ${CMAKE_CURRENT_LIST_DIR}/AudioTracks.cpp
    ${CMAKE_CURRENT_LIST_DIR}/FindBextKeyword.cpp
    ${CMAKE_CURRENT_LIST_DIR}/FrameRateSettings.cpp
    ${CMAKE_CURRENT_LIST_DIR}/FrameRateTable.cpp
    ${CMAKE_CURRENT_LIST_DIR}/GetFileCreationTime.cpp
    ${CMAKE_CURRENT_LIST_DIR}/IsToggleOn.cpp
    ${CMAKE_CURRENT_LIST_DIR}/Media.cpp
    ${CMAKE_CURRENT_LIST_DIR}/MetadataSelection.cpp
    ${CMAKE_CURRENT_LIST_DIR}/MobIDFromMetadata.cpp
    ${CMAKE_CURRENT_LIST_DIR}/Movie.cpp
    ${CMAKE_CURRENT_LIST_DIR}/TextForms.cpp
    ${CMAKE_CURRENT_LIST_DIR}/TextHelpers.cpp
    ${CMAKE_CURRENT_LIST_DIR}/TimeCodeInfo.cpp
    ${CMAKE_CURRENT_LIST_DIR}/Timecode.cpp
    ${CMAKE_CURRENT_LIST_DIR}/Track.cpp
    ${CMAKE_CURRENT_LIST_DIR}/TruncateToInteger.cpp)
