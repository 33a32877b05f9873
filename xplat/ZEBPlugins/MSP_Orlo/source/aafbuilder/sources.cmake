# The AAF clip builder: a Movie written as the Mobs, slots, descriptors and
# comments of a transient AAF file.
target_sources(OrloPlugin PRIVATE
    ${CMAKE_CURRENT_LIST_DIR}/AAFFromMovie.cpp
    ${CMAKE_CURRENT_LIST_DIR}/AAFFromMovieWithGrouping.cpp
    ${CMAKE_CURRENT_LIST_DIR}/AddAudioDescriptor.cpp
    ${CMAKE_CURRENT_LIST_DIR}/AddAudioTracksFromGroupingToAAF.cpp
    ${CMAKE_CURRENT_LIST_DIR}/AddAudioTracksToAAF.cpp
    ${CMAKE_CURRENT_LIST_DIR}/AddLocator.cpp
    ${CMAKE_CURRENT_LIST_DIR}/AddMovieMetaData.cpp
    ${CMAKE_CURRENT_LIST_DIR}/AddTimecode.cpp
    ${CMAKE_CURRENT_LIST_DIR}/CAAFBuiltinDefs.cpp
    ${CMAKE_CURRENT_LIST_DIR}/ClipSteps.cpp
    ${CMAKE_CURRENT_LIST_DIR}/FrameRateAndDropToString.cpp
    ${CMAKE_CURRENT_LIST_DIR}/NewAAFFromMovie.cpp
    ${CMAKE_CURRENT_LIST_DIR}/TransientClip.cpp
    ${CMAKE_CURRENT_LIST_DIR}/WideThroughString.cpp)
