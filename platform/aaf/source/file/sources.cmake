# The transient file and the library's C entry points.
target_sources(com-api PRIVATE
    ${CMAKE_CURRENT_LIST_DIR}/EntryPoints.cpp
    ${CMAKE_CURRENT_LIST_DIR}/TransientFile.cpp)
