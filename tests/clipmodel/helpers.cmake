# Tests of the clip model's value types and helpers.
list(APPEND clipmodel_test_sources
    ${CMAKE_CURRENT_LIST_DIR}/FrameRateSettingsTest.cpp
    ${CMAKE_CURRENT_LIST_DIR}/FrameRateTableTest.cpp
    ${CMAKE_CURRENT_LIST_DIR}/TextFormsTest.cpp
    ${CMAKE_CURRENT_LIST_DIR}/TextHelpersTest.cpp
    ${CMAKE_CURRENT_LIST_DIR}/TimeCodeInfoTest.cpp
    ${CMAKE_CURRENT_LIST_DIR}/TimecodeTest.cpp
    ${CMAKE_CURRENT_LIST_DIR}/TruncateToIntegerTest.cpp)
