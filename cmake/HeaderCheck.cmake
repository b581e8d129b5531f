# orv_check_headers(<target> <folder>...): compiles every header of the folders on its own, as the
# first include of a generated source, so a header that leans on what its includer happened to
# include fails the build instead of its next user.
function(orv_check_headers target)
    set(sources)
    foreach(folder IN LISTS ARGN)
        file(GLOB headers RELATIVE ${PROJECT_SOURCE_DIR}/src ${folder}/*.h)
        foreach(header IN LISTS headers)
            string(MAKE_C_IDENTIFIER ${header} stem)
            set(source ${CMAKE_CURRENT_BINARY_DIR}/header_check/${stem}.cpp)
            file(CONFIGURE OUTPUT ${source} CONTENT "#include \"${header}\"\n#include \"${header}\"\n")
            list(APPEND sources ${source})
        endforeach()
    endforeach()
    add_library(${target}_header_check OBJECT ${sources})
    target_link_libraries(${target}_header_check PRIVATE ${target})
endfunction()
