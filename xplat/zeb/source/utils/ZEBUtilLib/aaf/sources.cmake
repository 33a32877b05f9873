# The AAF library loader, the descriptor extensions and the object-tree dump.
target_sources(ZEBUtilLib PRIVATE
    ${CMAKE_CURRENT_LIST_DIR}/AAFDLL.cpp
    ${CMAKE_CURRENT_LIST_DIR}/AAFForwarders.cpp
    ${CMAKE_CURRENT_LIST_DIR}/AAFLoaderPlatform.cpp
    ${CMAKE_CURRENT_LIST_DIR}/AAFUnloadWrapper.cpp)
target_link_libraries(ZEBUtilLib PUBLIC ${CMAKE_DL_LIBS})
target_sources(ZEBUtilLib PRIVATE
    ${CMAKE_CURRENT_LIST_DIR}/AAFDescriptorExtensions.cpp
    ${CMAKE_CURRENT_LIST_DIR}/AAFImageGeometry.cpp
    ${CMAKE_CURRENT_LIST_DIR}/AAFTreeReader.cpp
    ${CMAKE_CURRENT_LIST_DIR}/dumpAAF.cpp)
