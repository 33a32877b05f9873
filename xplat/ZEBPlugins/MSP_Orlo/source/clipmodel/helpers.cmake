# The clip model's value types and helpers: timecode arithmetic, frame rates,
# text forms.
target_sources(OrloPlugin PRIVATE
    ${CMAKE_CURRENT_LIST_DIR}/FrameRateSettings.cpp
    ${CMAKE_CURRENT_LIST_DIR}/FrameRateTable.cpp
    ${CMAKE_CURRENT_LIST_DIR}/TextForms.cpp
    ${CMAKE_CURRENT_LIST_DIR}/TextHelpers.cpp
    ${CMAKE_CURRENT_LIST_DIR}/TimeCodeInfo.cpp
    ${CMAKE_CURRENT_LIST_DIR}/Timecode.cpp
    ${CMAKE_CURRENT_LIST_DIR}/TruncateToInteger.cpp)
