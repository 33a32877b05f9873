# The object model's core: the schema and its definitions, the type
# definitions, objects, values and properties.
target_sources(com-api PRIVATE
    ${CMAKE_CURRENT_LIST_DIR}/BuiltinSchema.cpp
    ${CMAKE_CURRENT_LIST_DIR}/ClassDefinition.cpp
    ${CMAKE_CURRENT_LIST_DIR}/DataDefinition.cpp
    ${CMAKE_CURRENT_LIST_DIR}/MetaDefinitionBase.cpp
    ${CMAKE_CURRENT_LIST_DIR}/ModelObject.cpp
    ${CMAKE_CURRENT_LIST_DIR}/Property.cpp
    ${CMAKE_CURRENT_LIST_DIR}/PropertyDefinition.cpp
    ${CMAKE_CURRENT_LIST_DIR}/PropertyValue.cpp
    ${CMAKE_CURRENT_LIST_DIR}/Schema.cpp
    ${CMAKE_CURRENT_LIST_DIR}/TypeDefEnumeration.cpp
    ${CMAKE_CURRENT_LIST_DIR}/TypeDefIndirectType.cpp
    ${CMAKE_CURRENT_LIST_DIR}/TypeDefInteger.cpp
    ${CMAKE_CURRENT_LIST_DIR}/TypeDefRecordType.cpp
    ${CMAKE_CURRENT_LIST_DIR}/TypeDefStringType.cpp
    ${CMAKE_CURRENT_LIST_DIR}/TypeDefStrongReference.cpp
    ${CMAKE_CURRENT_LIST_DIR}/TypeDefVariableArrayType.cpp
    ${CMAKE_CURRENT_LIST_DIR}/TypeDefWeakReference.cpp
    ${CMAKE_CURRENT_LIST_DIR}/TypeDefinition.cpp
    ${CMAKE_CURRENT_LIST_DIR}/Value.cpp
    ${CMAKE_CURRENT_LIST_DIR}/WideText.cpp)
