# Sample access: the sample map that the host reads PCM by, and the storage
# callback it holds as its default way to the file's bytes.
target_sources(OrloPlugin PRIVATE
    ${CMAKE_CURRENT_LIST_DIR}/OrloReaderSampleMapping.cpp
    ${CMAKE_CURRENT_LIST_DIR}/OrloReaderStorageCallback.cpp)
