# The string layer: the host string wrapper, its utilities, literal buffers
# and the conversions to and from wide text.
target_sources(ZEBUtilLib PRIVATE
    ${CMAKE_CURRENT_LIST_DIR}/UTFConversions.cpp
    ${CMAKE_CURRENT_LIST_DIR}/ZEBString.cpp
    ${CMAKE_CURRENT_LIST_DIR}/ZEBStringUtils.cpp
    ${CMAKE_CURRENT_LIST_DIR}/tovUTF16LiteralToUTF16.cpp)
