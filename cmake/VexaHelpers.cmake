# vexa_add_library(<Name>
#     DIR <folder name used in include paths, e.g. utilities>
#     SOURCES <.cpp and .h files, relative to the current source dir>
#     PUBLIC_HEADERS <headers installed for hosts>
#     PUBLIC_LIBS <...> PRIVATE_LIBS <...>
#     [OUTPUT_NAME <file base name>] [INCLUDE_BASE <dir>])
#
# Creates target vexa_<dir> with the alias Vexa::<Name>, an export header
# <dir>/<dir>_export.h defining <DIR>_EXPORT, build and install include paths,
# and installs the target into the VexaTargets export set.
# Headers are included as <dir/file.h>: a platform library's folder is its include prefix.
function(vexa_add_library name)
    cmake_parse_arguments(ARG "" "DIR;INCLUDE_BASE;OUTPUT_NAME" "SOURCES;PUBLIC_HEADERS;PUBLIC_LIBS;PRIVATE_LIBS" ${ARGN})
    set(target vexa_${ARG_DIR})
    string(REPLACE "-" "_" target "${target}")
    add_library(${target} ${ARG_SOURCES})
    add_library(Vexa::${name} ALIAS ${target})
    string(TOUPPER "${ARG_DIR}" upper)
    set(macro VEXA_${upper}_EXPORT)
    if(upper STREQUAL "VEXA")
        set(macro VEXA_EXPORT)
    endif()
    generate_export_header(${target}
        BASE_NAME ${upper}
        EXPORT_MACRO_NAME ${macro}
        EXPORT_FILE_NAME "${PROJECT_BINARY_DIR}/include/${ARG_DIR}/${ARG_DIR}_export.h")
    if(NOT ARG_INCLUDE_BASE)
        get_filename_component(ARG_INCLUDE_BASE "${CMAKE_CURRENT_SOURCE_DIR}" DIRECTORY)
    endif()
    target_include_directories(${target} PUBLIC
        "$<BUILD_INTERFACE:${ARG_INCLUDE_BASE}>"
        "$<BUILD_INTERFACE:${PROJECT_BINARY_DIR}/include>"
        "$<INSTALL_INTERFACE:${CMAKE_INSTALL_INCLUDEDIR}/vexa>")
    target_link_libraries(${target} PUBLIC ${ARG_PUBLIC_LIBS} PRIVATE ${ARG_PRIVATE_LIBS})
    if(NOT ARG_OUTPUT_NAME)
        set(ARG_OUTPUT_NAME vexa-${ARG_DIR})
    endif()
    set_target_properties(${target} PROPERTIES
        EXPORT_NAME ${name}
        OUTPUT_NAME ${ARG_OUTPUT_NAME}
        VERSION ${PROJECT_VERSION}
        SOVERSION ${PROJECT_VERSION_MAJOR}
        INSTALL_RPATH "$ORIGIN"
        CXX_VISIBILITY_PRESET hidden
        VISIBILITY_INLINES_HIDDEN ON)
    install(TARGETS ${target} EXPORT VexaTargets
        LIBRARY DESTINATION ${CMAKE_INSTALL_LIBDIR}
        ARCHIVE DESTINATION ${CMAKE_INSTALL_LIBDIR}
        RUNTIME DESTINATION ${CMAKE_INSTALL_BINDIR}
        INCLUDES DESTINATION ${CMAKE_INSTALL_INCLUDEDIR}/vexa)
    foreach(header ${ARG_PUBLIC_HEADERS})
        if(IS_ABSOLUTE "${header}")
            file(RELATIVE_PATH header "${CMAKE_CURRENT_SOURCE_DIR}" "${header}")
        endif()
        get_filename_component(subdir "${header}" DIRECTORY)
        install(FILES "${header}" DESTINATION "${CMAKE_INSTALL_INCLUDEDIR}/vexa/${ARG_DIR}/${subdir}")
    endforeach()
    install(FILES "${PROJECT_BINARY_DIR}/include/${ARG_DIR}/${ARG_DIR}_export.h"
        DESTINATION "${CMAKE_INSTALL_INCLUDEDIR}/vexa/${ARG_DIR}")
endfunction()

# vexa_add_test(<tst_name> SOURCES <...> LIBS <...> [TIMEOUT <s>])
# One executable and one CTest entry per test class, run on the offscreen platform.
function(vexa_add_test name)
    cmake_parse_arguments(ARG "" "TIMEOUT" "SOURCES;LIBS" ${ARGN})
    add_executable(${name} ${ARG_SOURCES})
    target_link_libraries(${name} PRIVATE ${ARG_LIBS} Qt5::Test)
    target_compile_definitions(${name} PRIVATE QT_FORCE_ASSERTS
        VEXA_SOURCE_DIR="${PROJECT_SOURCE_DIR}")
    # Shared fixtures: #include <common/...>.
    target_include_directories(${name} PRIVATE "${PROJECT_SOURCE_DIR}/tests")
    add_test(NAME ${name} COMMAND ${name})
    if(NOT ARG_TIMEOUT)
        set(ARG_TIMEOUT 120)
    endif()
    set_tests_properties(${name} PROPERTIES
        TIMEOUT ${ARG_TIMEOUT}
        ENVIRONMENT "QT_QPA_PLATFORM=offscreen;QT_LOGGING_RULES=*.debug=false")
endfunction()
