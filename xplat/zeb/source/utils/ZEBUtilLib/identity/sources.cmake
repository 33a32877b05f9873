# Identity helpers: content identifiers through the host's generator, Mob IDs
# and UIDs from and to text, comparisons, and the product identification.
target_sources(ZEBUtilLib PRIVATE
    ${CMAKE_CURRENT_LIST_DIR}/CreateUIDGenerator.cpp
    ${CMAKE_CURRENT_LIST_DIR}/GenerateUMIDFromData.cpp
    ${CMAKE_CURRENT_LIST_DIR}/GenerateUMIDFromFileContent.cpp
    ${CMAKE_CURRENT_LIST_DIR}/GetMobIDFromString.cpp)
