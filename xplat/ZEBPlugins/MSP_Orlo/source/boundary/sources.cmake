# The module's boundary: its globals and start-up, what it says of itself, the
# toggles, the host's grouping setting and the Movie of one file; the
# container and its clip list, and the table of components. The module's
# exports (OrloModuleEntry.cpp) are compiled by the module alone.
target_sources(OrloPlugin PRIVATE
    ${CMAKE_CURRENT_LIST_DIR}/AudioImportSettings.cpp
    ${CMAKE_CURRENT_LIST_DIR}/DynamicToggles.cpp
    ${CMAKE_CURRENT_LIST_DIR}/ModuleGlobals.cpp
    ${CMAKE_CURRENT_LIST_DIR}/NewMovieFromFilePath.cpp
    ${CMAKE_CURRENT_LIST_DIR}/OrloComponents.cpp
    ${CMAKE_CURRENT_LIST_DIR}/OrloReaderClips.cpp
    ${CMAKE_CURRENT_LIST_DIR}/OrloReaderMovContainer.cpp
    ${CMAKE_CURRENT_LIST_DIR}/PluginStartup.cpp)
