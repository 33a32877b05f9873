# Identity helpers: content identifiers through the host's generator, Mob IDs
# and UIDs from and to text (IDText: the hex forms every text form is made of),
# comparisons, the product identification, and the in-place path standardising
# of the AAF helpers.
target_sources(ZEBUtilLib PRIVATE
    ${CMAKE_CURRENT_LIST_DIR}/CreateUIDGenerator.cpp
    ${CMAKE_CURRENT_LIST_DIR}/GenerateUMIDFromData.cpp
    ${CMAKE_CURRENT_LIST_DIR}/GenerateUMIDFromFileContent.cpp
    ${CMAKE_CURRENT_LIST_DIR}/GetMobIDFromString.cpp
    ${CMAKE_CURRENT_LIST_DIR}/GetProductID.cpp
    ${CMAKE_CURRENT_LIST_DIR}/IDComparison.cpp
    ${CMAKE_CURRENT_LIST_DIR}/IDText.cpp
    ${CMAKE_CURRENT_LIST_DIR}/IDToString.cpp
    ${CMAKE_CURRENT_LIST_DIR}/StandardizePath.cpp)
