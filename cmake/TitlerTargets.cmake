# Options that every target of this project shares.
add_library(titler_options INTERFACE)
target_include_directories(titler_options INTERFACE ${CMAKE_SOURCE_DIR})
target_compile_definitions(titler_options INTERFACE QT_DEPRECATED_WARNINGS QT_NO_KEYWORDS)
target_compile_options(titler_options INTERFACE -Wall -Wextra -Wpedantic -Wshadow -Wnon-virtual-dtor -Woverloaded-virtual)
if(TITLER_WERROR)
    target_compile_options(titler_options INTERFACE -Werror)
endif()
if(TITLER_SANITIZE)
    # Casts of floating numbers are no part of "undefined", and the checks of the containers belong to the library.
    set(TITLER_SANITIZERS address,undefined,float-cast-overflow)
    target_compile_options(titler_options INTERFACE -fsanitize=${TITLER_SANITIZERS} -fno-sanitize-recover=all
                                                    -fno-omit-frame-pointer)
    target_compile_definitions(titler_options INTERFACE _GLIBCXX_ASSERTIONS)
    target_link_options(titler_options INTERFACE -fsanitize=${TITLER_SANITIZERS})
endif()
if(TITLER_FUZZ)
    target_compile_options(titler_options INTERFACE -fsanitize=fuzzer-no-link)
endif()

# Most of the time of a compilation goes into reading Qt's and the standard library's headers. They are precompiled once
# for each set of Qt modules, since a module's macro changes what its headers mean: Core, Core and Gui, all three.
option(TITLER_PRECOMPILE "Precompile the headers of Qt and of the standard library" ON)
set(TITLER_PRECOMPILED_Core <algorithm> <array> <atomic> <cstdint> <cstring> <deque> <functional> <map> <memory> <mutex>
    <optional> <string> <thread> <utility> <vector> <QByteArray> <QCoreApplication> <QDir> <QFile> <QFileInfo> <QHash>
    <QList> <QMap> <QMutex> <QObject> <QPointer> <QString> <QStringList> <QThread> <QTimer> <QVariant>)
set(TITLER_PRECOMPILED_Gui ${TITLER_PRECOMPILED_Core} <QColor> <QFont> <QFontMetrics> <QGuiApplication> <QImage>
    <QImageReader> <QPainter> <QPixmap> <QTransform>)
set(TITLER_PRECOMPILED_Widgets ${TITLER_PRECOMPILED_Gui} <QAbstractItemView> <QAction> <QApplication> <QComboBox> <QDialog>
    <QGraphicsScene> <QGraphicsTextItem> <QGraphicsView> <QHBoxLayout> <QKeyEvent> <QLabel> <QLineEdit> <QMouseEvent>
    <QPainterPath> <QPushButton> <QScrollBar> <QStyle> <QTextCursor> <QTextDocument> <QTextLayout> <QTouchEvent>
    <QUndoStack> <QVBoxLayout> <QWidget>)
# Programs of tests are two thirds of all sources and run for seconds: compiling them with few optimisations saves more
# than they lose. They have precompiled headers of their own, with those that most of them include besides, and are linked
# by gold where it is installed, which takes a third of the time.
set(TITLER_TEST_OPTIMISATION -O1)
include(CheckLinkerFlag)
check_linker_flag(CXX -fuse-ld=gold TITLER_HAS_GOLD)
set(TITLER_PRECOMPILED_BY_TESTS <QSignalSpy> <QTemporaryDir> <QTest>)
# The folders of a test's sources would be macros with another value in each folder. Nothing asks for them here, and
# precompiled headers have to be the same everywhere.
set_target_properties(Qt6::Test PROPERTIES INTERFACE_COMPILE_DEFINITIONS QT_TESTLIB_LIB)
if(TITLER_PRECOMPILE)
    file(CONFIGURE OUTPUT ${CMAKE_BINARY_DIR}/precompiled/nothing.cpp CONTENT "")
    foreach(module Core Gui Widgets)
        foreach(kind "" Tests)
            set(name titler_precompiled_${module}${kind})
            add_library(${name} OBJECT ${CMAKE_BINARY_DIR}/precompiled/nothing.cpp)
            target_link_libraries(${name} PRIVATE titler_options Qt6::${module})
            target_precompile_headers(${name} PRIVATE ${TITLER_PRECOMPILED_${module}})
            set_target_properties(${name} PROPERTIES AUTOMOC OFF AUTORCC OFF)
        endforeach()
        target_link_libraries(${name} PRIVATE Qt6::Test)
        target_compile_options(${name} PRIVATE ${TITLER_TEST_OPTIMISATION})
        target_precompile_headers(${name} PRIVATE ${TITLER_PRECOMPILED_BY_TESTS})
    endforeach()
endif()

# titler_qt_modules(RESULT TARGET) adds to RESULT the Qt modules that TARGET links directly or through others.
function(titler_qt_modules result target)
    set(found ${${result}})
    get_target_property(links ${target} LINK_LIBRARIES)
    foreach(link IN LISTS links)
        if(link MATCHES "^Qt6::(Core|Gui|Widgets)$")
            list(APPEND found ${CMAKE_MATCH_1})
        elseif(link MATCHES "^titler_" AND NOT link STREQUAL titler_options AND TARGET ${link})
            titler_qt_modules(found ${link})
        endif()
    endforeach()
    set(${result} ${found} PARENT_SCOPE)
endfunction()

# titler_precompile(TARGET [Tests]) gives TARGET the precompiled headers of the Qt modules that it links, those for tests
# where it is one. What it links must be known by then.
function(titler_precompile target)
    set(modules)
    titler_qt_modules(modules ${target})
    foreach(module Widgets Gui Core)
        if(TITLER_PRECOMPILE AND module IN_LIST modules)
            target_precompile_headers(${target} REUSE_FROM titler_precompiled_${module}${ARGN})
            return()
        endif()
    endforeach()
endfunction()

# titler_precompile_later(TARGET) does so at the end of the folder's CMakeLists.txt.
macro(titler_precompile_later target)
    cmake_language(EVAL CODE "cmake_language(DEFER CALL titler_precompile [[${target}]])")
endmacro()

# titler_moc_test(TARGET) runs moc for the sources of a test: for each .cpp file, which includes its .moc at the end, and for
# each header with a Q_OBJECT. CMake's AUTOMOC would start a process and compile one more source for each of the two hundred
# tests. It looks for Q_OBJECT while CMake runs: a header that gets its first one needs another run.
function(titler_moc_test target)
    get_target_property(sources ${target} SOURCES)
    set(folder ${CMAKE_CURRENT_BINARY_DIR}/${target}_moc)
    file(MAKE_DIRECTORY ${folder})
    foreach(source IN LISTS sources)
        get_filename_component(name ${source} NAME_WE)
        file(STRINGS ${source} lines REGEX "^#include \"${name}\\.moc\"|^ *Q_OBJECT")
        if(lines)
            set(made ${folder}/${name}.moc)
            if(source MATCHES "\\.h$")
                set(made ${folder}/moc_${name}.cpp)
            endif()
            qt_generate_moc(${source} ${made} TARGET ${target})
            target_sources(${target} PRIVATE ${made})
        endif()
    endforeach()
    target_include_directories(${target} PRIVATE ${folder})
endfunction()

# titler_finish_test(TARGET) gives a test program what all of them share, in part at the end of the folder's CMakeLists.txt.
macro(titler_finish_test target)
    set_target_properties(${target} PROPERTIES AUTOMOC OFF RUNTIME_OUTPUT_DIRECTORY ${TITLER_TEST_DIR})
    target_compile_options(${target} PRIVATE ${TITLER_TEST_OPTIMISATION})
    if(TITLER_HAS_GOLD)
        target_link_options(${target} PRIVATE -fuse-ld=gold)
    endif()
    add_dependencies(${target} titler_fonts)
    cmake_language(EVAL CODE "cmake_language(DEFER CALL titler_precompile [[${target}]] Tests)")
    cmake_language(EVAL CODE "cmake_language(DEFER CALL titler_moc_test [[${target}]])")
endmacro()

# titler_add_library(NAME SOURCES... ) makes the static library of one source folder.
function(titler_add_library name)
    add_library(${name} STATIC ${ARGN})
    target_link_libraries(${name} PUBLIC titler_options)
    titler_precompile_later(${name})
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
    QTEST_FUNCTION_TIMEOUT=2400000
    HOME=${TITLER_TEST_DIR}/home
    XDG_DATA_HOME=${TITLER_TEST_DIR}/xdg/data
    XDG_CONFIG_HOME=${TITLER_TEST_DIR}/xdg/config
    XDG_CACHE_HOME=${TITLER_TEST_DIR}/xdg/cache
    XDG_RUNTIME_DIR=${TITLER_TEST_DIR}/xdg/runtime
    FONTCONFIG_FILE=${TITLER_FONTS_CONF}
    K2SYS_LOG_DIR=${TITLER_TEST_DIR}/log
    ASAN_OPTIONS=exitcode=86:detect_leaks=1:detect_stack_use_after_return=1
    LSAN_OPTIONS=suppressions=${CMAKE_SOURCE_DIR}/cmake/lsan.supp:print_suppressions=0
    UBSAN_OPTIONS=print_stacktrace=1:halt_on_error=1)

# The time limit of a test ends what hangs. Most need seconds of it, so that a machine with much other work does not end
# what is only slow.
set(TITLER_TEST_SECONDS 1200)
# The temporary files of most tests are in memory where there is room for them: while other programs sync, each rename on
# the disk can take seconds. Tests of the whole programs work on the disk.
set(TITLER_TEST_MEMORY "")
execute_process(COMMAND df --output=avail -BG /dev/shm OUTPUT_VARIABLE room ERROR_QUIET)
if(room MATCHES "([0-9]+)G" AND CMAKE_MATCH_1 GREATER_EQUAL 4)
    set(TITLER_TEST_MEMORY TMPDIR=/dev/shm)
endif()

# Tests with a long form that takes hours end what hangs themselves.
set(TITLER_LONG_FORM_SECONDS 100000)

# Sanitizers make everything slower, so the time limits of the tests grow by this factor.
if(TITLER_SANITIZE)
    set(TITLER_TEST_TIME_FACTOR 2 CACHE STRING "Factor on the time limits of the tests")
else()
    set(TITLER_TEST_TIME_FACTOR 1 CACHE STRING "Factor on the time limits of the tests")
endif()

# titler_set_test(NAME SECONDS VARIABLE=VALUE... ) gives a registered test what every test has: its time limit, the
# environment above with the changes given, and failure by whatever a sanitizer says, also in a child process that the
# test itself would not notice.
function(titler_set_test name seconds)
    math(EXPR limit "${seconds} * ${TITLER_TEST_TIME_FACTOR}")
    set_tests_properties(${name} PROPERTIES
        TIMEOUT ${limit}
        ENVIRONMENT "${TITLER_TEST_ENVIRONMENT};${ARGN}"
        FAIL_REGULAR_EXPRESSION "ERROR: [A-Za-z]*Sanitizer;WARNING: [A-Za-z]*Sanitizer;runtime error:")
endfunction()

# titler_add_test(NAME LIBS... ) builds tests/<folder>/NAME.cpp as one QtTest program and registers it.
# Tests run without a display unless they say otherwise.
function(titler_add_test name)
    add_executable(${name} ${name}.cpp)
    target_link_libraries(${name} PRIVATE titler_options Qt6::Test ${ARGN})
    titler_finish_test(${name})
    add_test(NAME ${name} COMMAND ${name})
    titler_set_test(${name} ${TITLER_TEST_SECONDS} QT_QPA_PLATFORM=offscreen ${TITLER_TEST_MEMORY})
endfunction()
