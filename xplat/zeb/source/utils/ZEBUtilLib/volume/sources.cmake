# Volumes, paths and URLs: so far the file URLs that locators hold.
target_sources(ZEBUtilLib PRIVATE
    ${CMAKE_CURRENT_LIST_DIR}/URLUtils.cpp)
