# Start-up and shutdown of the library, its globals, and the logger.
target_sources(ZEBUtilLib PRIVATE
    ${CMAKE_CURRENT_LIST_DIR}/ZEBLogger.cpp
    ${CMAKE_CURRENT_LIST_DIR}/ZEBUtilLib.cpp)
