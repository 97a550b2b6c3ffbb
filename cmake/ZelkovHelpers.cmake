# The few words that the CMake files of all rooms are written in.

# What every target of ours is compiled with.
function(zelkov_target_defaults target)
    target_compile_features(${target} PUBLIC cxx_std_17)
    target_compile_definitions(${target} PRIVATE
        QT_NO_KEYWORDS QT_NO_CAST_FROM_ASCII QT_NO_FOREACH QT_DEPRECATED_WARNINGS)
    target_compile_options(${target} PRIVATE -Wall -Wextra -Wshadow -Wconversion
        $<$<BOOL:${ZELKOV_DEVELOPER}>:-Werror>)
    if(CMAKE_UNITY_BUILD AND CMAKE_CXX_COMPILER_ID STREQUAL "GNU")
        # A batch includes the sources, and GCC then takes their unnamed namespaces for a header's.
        target_compile_options(${target} PRIVATE -Wno-subobject-linkage)
    endif()
    if(ZELKOV_SANITIZE)
        target_compile_options(${target} PRIVATE -fno-omit-frame-pointer -fno-sanitize-recover=all
            -fsanitize=address,undefined,float-divide-by-zero,float-cast-overflow)
        target_compile_definitions(${target} PRIVATE _GLIBCXX_ASSERTIONS QT_FORCE_ASSERTS)
        target_link_options(${target} PUBLIC -fsanitize=address,undefined)
    endif()
endfunction()

# A library of ours: zelkov_add_library(ZelkovWidgets Widgets src) makes Zelkov::Widgets, whose headers
# are named from <base> in the sources and from <prefix>/include/zelkov when installed.
function(zelkov_add_library target alias base)
    add_library(${target})
    add_library(Zelkov::${alias} ALIAS ${target})
    set_target_properties(${target} PROPERTIES
        EXPORT_NAME ${alias}
        VERSION ${PROJECT_VERSION}
        SOVERSION ${PROJECT_VERSION_MAJOR}
        # The libraries find each other in whatever prefix they stand.
        INSTALL_RPATH "$ORIGIN")
    target_include_directories(${target} PUBLIC
        $<BUILD_INTERFACE:${base}>
        $<BUILD_INTERFACE:${PROJECT_BINARY_DIR}/generated>
        $<INSTALL_INTERFACE:${CMAKE_INSTALL_INCLUDEDIR}/zelkov>)
    zelkov_target_defaults(${target})
    if(BUILD_SHARED_LIBS)
        target_link_options(${target} PRIVATE -Wl,--no-undefined)
    endif()
    set_property(GLOBAL APPEND PROPERTY ZELKOV_INSTALLED_TARGETS ${target})
endfunction()

# The export macro of a library, in the room's own folder: <room>/Export.h.
function(zelkov_export_header target room macro)
    include(GenerateExportHeader)
    set(file "${PROJECT_BINARY_DIR}/generated/${room}/Export.h")
    generate_export_header(${target} BASE_NAME ${macro} EXPORT_FILE_NAME "${file}")
    if(NOT BUILD_SHARED_LIBS)
        string(TOUPPER "${macro}" upper)
        target_compile_definitions(${target} PUBLIC ${upper}_STATIC_DEFINE)
    endif()
    install(FILES "${file}" DESTINATION ${CMAKE_INSTALL_INCLUDEDIR}/zelkov/${room} COMPONENT dev)
endfunction()

# zelkov_add_classes(<target> <room> <Class>...): adds <Class>.h and, where there is one, <Class>.cpp of
# the current folder, and installs the headers as <room>/<Class>.h.
function(zelkov_add_classes target room)
    foreach(class IN LISTS ARGN)
        set(stem "${CMAKE_CURRENT_SOURCE_DIR}/${class}")
        if(EXISTS "${stem}.h")
            target_sources(${target} PRIVATE "${stem}.h")
            install(FILES "${stem}.h" DESTINATION ${CMAKE_INSTALL_INCLUDEDIR}/zelkov/${room} COMPONENT dev)
        endif()
        if(EXISTS "${stem}.cpp")
            target_sources(${target} PRIVATE "${stem}.cpp")
        elseif(NOT EXISTS "${stem}.h")
            message(FATAL_ERROR "${room} has neither ${class}.h nor ${class}.cpp")
        endif()
    endforeach()
endfunction()

# Adds those of the named folders that have a CMakeLists.txt.
macro(zelkov_add_rooms)
    foreach(room ${ARGN})
        if(EXISTS "${CMAKE_CURRENT_SOURCE_DIR}/${room}/CMakeLists.txt")
            add_subdirectory(${room})
        endif()
    endforeach()
endmacro()

# The environment of every test run.
function(zelkov_test_environment out)
    cmake_parse_arguments(arg "" "PLATFORM" "" ${ARGN})
    if(NOT arg_PLATFORM)
        set(arg_PLATFORM offscreen)
    endif()
    set(environment
        "QT_QPA_PLATFORM=${arg_PLATFORM}"
        "XDG_RUNTIME_DIR=${PROJECT_BINARY_DIR}/xdg"
        "LC_ALL=C.UTF-8" "TZ=UTC" "QT_HASH_SEED=0"
        "FONTCONFIG_FILE=${PROJECT_SOURCE_DIR}/tests/data/fonts.conf"
        "DBUS_SESSION_BUS_ADDRESS=disabled:"
        "QTEST_FUNCTION_TIMEOUT=120000" "QTEST_DISABLE_STACK_DUMP=1")
    if(ZELKOV_SANITIZE)
        list(APPEND environment
            "ASAN_OPTIONS=detect_stack_use_after_return=1:strict_string_checks=1:check_initialization_order=1"
            "LSAN_OPTIONS=suppressions=${PROJECT_SOURCE_DIR}/tests/data/lsan.supp:print_suppressions=0")
    endif()
    set(${out} "${environment}" PARENT_SCOPE)
endfunction()

# zelkov_add_test(tst_x [LABELS l...] [LIBRARIES lib...] [SOURCES extra...] [DEFINITIONS d...]
#                 [PLATFORM p] [TIMEOUT s] [SERIAL] [NO_CTEST])
# One executable of tst_x.cpp; NO_CTEST leaves the add_test call to a wrapper.
function(zelkov_add_test name)
    cmake_parse_arguments(arg "SERIAL;NO_CTEST" "PLATFORM;TIMEOUT" "LABELS;LIBRARIES;SOURCES;DEFINITIONS" ${ARGN})
    add_executable(${name} ${name}.cpp ${arg_SOURCES})
    zelkov_target_defaults(${name})
    target_compile_definitions(${name} PRIVATE ${arg_DEFINITIONS})
    target_link_libraries(${name} PRIVATE Zelkov::Widgets zelkov_test_support ${arg_LIBRARIES})
    add_dependencies(zelkov_tests ${name})
    if(arg_NO_CTEST)
        return()
    endif()
    if(NOT arg_TIMEOUT)
        set(arg_TIMEOUT 180)
    endif()
    if(NOT arg_LABELS)
        set(arg_LABELS unit)
    endif()
    zelkov_test_environment(environment PLATFORM "${arg_PLATFORM}")
    add_test(NAME ${name} COMMAND ${name})
    set_tests_properties(${name} PROPERTIES
        ENVIRONMENT "${environment}"
        LABELS "${arg_LABELS}"
        TIMEOUT ${arg_TIMEOUT}
        FAIL_REGULAR_EXPRESSION "WARNING: ;QWARN  :")
    if(arg_SERIAL)
        set_tests_properties(${name} PROPERTIES RUN_SERIAL ON)
    endif()
endfunction()
