target_sources(OrloPlugin PRIVATE
    ${CMAKE_CURRENT_LIST_DIR}/AddTimeCodeFromMetadata.cpp
    ${CMAKE_CURRENT_LIST_DIR}/AudioMediaDescriptor.cpp
    ${CMAKE_CURRENT_LIST_DIR}/AudioTracks.cpp
    ${CMAKE_CURRENT_LIST_DIR}/GetFileCreationTime.cpp
    ${CMAKE_CURRENT_LIST_DIR}/IsToggleOn.cpp
    ${CMAKE_CURRENT_LIST_DIR}/Media.cpp
    ${CMAKE_CURRENT_LIST_DIR}/MetadataSelection.cpp
    ${CMAKE_CURRENT_LIST_DIR}/MobIDFromMetadata.cpp
    ${CMAKE_CURRENT_LIST_DIR}/Movie.cpp
    ${CMAKE_CURRENT_LIST_DIR}/Track.cpp)
