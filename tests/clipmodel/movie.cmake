list(APPEND clipmodel_test_sources
    ${CMAKE_CURRENT_LIST_DIR}/AudioTracksTest.cpp
    ${CMAKE_CURRENT_LIST_DIR}/ClipTest.cpp
    ${CMAKE_CURRENT_LIST_DIR}/InitFromFileTest.cpp
    ${CMAKE_CURRENT_LIST_DIR}/MetadataSelectionTest.cpp
    ${CMAKE_CURRENT_LIST_DIR}/MobIDTest.cpp
    ${CMAKE_CURRENT_LIST_DIR}/StartTimecodeTest.cpp)
