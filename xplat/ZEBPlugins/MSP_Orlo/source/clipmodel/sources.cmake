# The clip model: the Movie and its records, the rules that fill them from the
# chunks, timecode arithmetic and frame rates.
foreach(list helpers movie)
    if(EXISTS ${CMAKE_CURRENT_LIST_DIR}/${list}.cmake)
        include(${CMAKE_CURRENT_LIST_DIR}/${list}.cmake)
    endif()
endforeach()
