# The published interfaces over the model: one view per interface, made at
# an object's first query for it.
target_sources(com-api PRIVATE
    ${CMAKE_CURRENT_LIST_DIR}/CommentMarkerView.cpp
    ${CMAKE_CURRENT_LIST_DIR}/ComponentView.cpp
    ${CMAKE_CURRENT_LIST_DIR}/ContentStorageView.cpp
    ${CMAKE_CURRENT_LIST_DIR}/DescriptiveMarkerView.cpp
    ${CMAKE_CURRENT_LIST_DIR}/DictionaryView.cpp
    ${CMAKE_CURRENT_LIST_DIR}/DigitalImageDescriptorView.cpp
    ${CMAKE_CURRENT_LIST_DIR}/EssenceDescriptorView.cpp
    ${CMAKE_CURRENT_LIST_DIR}/EventMobSlotView.cpp
    ${CMAKE_CURRENT_LIST_DIR}/EventView.cpp
    ${CMAKE_CURRENT_LIST_DIR}/FileDescriptorView.cpp
    ${CMAKE_CURRENT_LIST_DIR}/FillerView.cpp
    ${CMAKE_CURRENT_LIST_DIR}/HeaderView.cpp
    ${CMAKE_CURRENT_LIST_DIR}/IdentificationView.cpp
    ${CMAKE_CURRENT_LIST_DIR}/ImportDescriptorView.cpp
    ${CMAKE_CURRENT_LIST_DIR}/LocatorView.cpp
    ${CMAKE_CURRENT_LIST_DIR}/MasterMobView.cpp
    ${CMAKE_CURRENT_LIST_DIR}/MobSlotView.cpp
    ${CMAKE_CURRENT_LIST_DIR}/MobSlots.cpp
    ${CMAKE_CURRENT_LIST_DIR}/MobView.cpp
    ${CMAKE_CURRENT_LIST_DIR}/MultipleDescriptorView.cpp
    ${CMAKE_CURRENT_LIST_DIR}/NetworkLocatorView.cpp
    ${CMAKE_CURRENT_LIST_DIR}/ObjectView.cpp
    ${CMAKE_CURRENT_LIST_DIR}/PCMDescriptorView.cpp
    ${CMAKE_CURRENT_LIST_DIR}/SegmentView.cpp
    ${CMAKE_CURRENT_LIST_DIR}/SequenceView.cpp
    ${CMAKE_CURRENT_LIST_DIR}/SoundDescriptorView.cpp
    ${CMAKE_CURRENT_LIST_DIR}/SourceClipView.cpp
    ${CMAKE_CURRENT_LIST_DIR}/SourceMobView.cpp
    ${CMAKE_CURRENT_LIST_DIR}/SourceReferenceView.cpp
    ${CMAKE_CURRENT_LIST_DIR}/TaggedValueList.cpp
    ${CMAKE_CURRENT_LIST_DIR}/TaggedValueView.cpp
    ${CMAKE_CURRENT_LIST_DIR}/TapeDescriptorView.cpp
    ${CMAKE_CURRENT_LIST_DIR}/TimecodeView.cpp
    ${CMAKE_CURRENT_LIST_DIR}/TimelineMobSlotView.cpp
    ${CMAKE_CURRENT_LIST_DIR}/ViewSupport.cpp)
