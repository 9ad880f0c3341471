# Options that every target of this project shares.
add_library(titler_options INTERFACE)
target_include_directories(titler_options INTERFACE ${CMAKE_SOURCE_DIR})
target_compile_definitions(titler_options INTERFACE QT_DEPRECATED_WARNINGS)
target_compile_options(titler_options INTERFACE -Wall -Wextra -Wpedantic -Wshadow -Wnon-virtual-dtor -Woverloaded-virtual)
if(TITLER_WERROR)
    target_compile_options(titler_options INTERFACE -Werror)
endif()
if(TITLER_SANITIZE)
    target_compile_options(titler_options INTERFACE -fsanitize=address,undefined -fno-sanitize-recover=undefined
                                                    -fno-omit-frame-pointer)
    target_link_options(titler_options INTERFACE -fsanitize=address,undefined)
endif()

# titler_add_library(NAME SOURCES... ) makes the static library of one source folder.
function(titler_add_library name)
    add_library(${name} STATIC ${ARGN})
    target_link_libraries(${name} PUBLIC titler_options)
endfunction()

include(TitlerFonts)

# What every test runs with: no display, a fixed locale and set of fonts, and folders of its own under the build tree, so
# that nothing depends on the user who runs it or is left in that user's home.
set(TITLER_TEST_DIR ${CMAKE_BINARY_DIR}/tests)
file(MAKE_DIRECTORY ${TITLER_TEST_DIR}/log ${TITLER_TEST_DIR}/home ${TITLER_TEST_DIR}/xdg/data ${TITLER_TEST_DIR}/xdg/config
                    ${TITLER_TEST_DIR}/xdg/cache)
file(MAKE_DIRECTORY ${TITLER_TEST_DIR}/xdg/runtime)
file(CHMOD ${TITLER_TEST_DIR}/xdg/runtime PERMISSIONS OWNER_READ OWNER_WRITE OWNER_EXECUTE)
set(TITLER_TEST_ENVIRONMENT
    LC_ALL=C.UTF-8
    HOME=${TITLER_TEST_DIR}/home
    XDG_DATA_HOME=${TITLER_TEST_DIR}/xdg/data
    XDG_CONFIG_HOME=${TITLER_TEST_DIR}/xdg/config
    XDG_CACHE_HOME=${TITLER_TEST_DIR}/xdg/cache
    XDG_RUNTIME_DIR=${TITLER_TEST_DIR}/xdg/runtime
    FONTCONFIG_FILE=${TITLER_FONTS_CONF}
    K2SYS_LOG_DIR=${TITLER_TEST_DIR}/log
    ASAN_OPTIONS=detect_leaks=1
    LSAN_OPTIONS=suppressions=${CMAKE_SOURCE_DIR}/cmake/lsan.supp:print_suppressions=0
    UBSAN_OPTIONS=print_stacktrace=1)

# titler_add_test(NAME LIBS... ) builds tests/<folder>/NAME.cpp as one QtTest program and registers it.
# Tests run without a display unless they say otherwise.
function(titler_add_test name)
    add_executable(${name} ${name}.cpp)
    target_link_libraries(${name} PRIVATE titler_options Qt6::Test ${ARGN})
    set_target_properties(${name} PROPERTIES RUNTIME_OUTPUT_DIRECTORY ${TITLER_TEST_DIR})
    add_dependencies(${name} titler_fonts)
    add_test(NAME ${name} COMMAND ${name})
    set_tests_properties(${name} PROPERTIES
        TIMEOUT 120
        ENVIRONMENT "QT_QPA_PLATFORM=offscreen;${TITLER_TEST_ENVIRONMENT}")
endfunction()
