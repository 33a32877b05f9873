# The lazy XML document model over the host's DOM, reader and writer.
target_sources(ZEBUtilLib PRIVATE
    ${CMAKE_CURRENT_LIST_DIR}/ZEBXmlAttribute.cpp
    ${CMAKE_CURRENT_LIST_DIR}/ZEBXmlCDATA.cpp
    ${CMAKE_CURRENT_LIST_DIR}/ZEBXmlDoc.cpp
    ${CMAKE_CURRENT_LIST_DIR}/ZEBXmlElement.cpp
    ${CMAKE_CURRENT_LIST_DIR}/ZEBXmlNode.cpp
    ${CMAKE_CURRENT_LIST_DIR}/ZEBXmlText.cpp)
