# SPDX-FileCopyrightText: The veluiextra developers
# SPDX-License-Identifier: LGPL-2.1-or-later

# The build folder would stand in every test's command line, and the compiler cache would
# miss in any other tree; QFINDTESTDATA, which needs it, is not used.
set_target_properties(${VEL_QT}::Test PROPERTIES INTERFACE_COMPILE_DEFINITIONS QT_TESTLIB_LIB)

# vel_add_test(<name> [X11] [SHARED] [BARE] [SOURCES <file>...] [LIBRARIES <target>...]
#              [LABELS <label>...])
#
# Builds <name>.cpp into a test program and registers it.
#   X11     runs it on an X server of its own with a window manager; without it the
#           test runs on Qt's offscreen platform.
#   SHARED  links the shared library, as a host application does, instead of the
#           internal objects that let a test reach the classes that are not exported.
#   BARE    links neither of the two (tests of the platform libraries and of programs).
#   LABELS  "random" for a test whose rounds VEL_TEST_ROUNDS sets, "threads" for one that the
#           thread sanitizer runs.
function(vel_add_test name)
    cmake_parse_arguments(ARG "X11;SHARED;BARE" "" "SOURCES;LIBRARIES;LABELS" ${ARGN})
    add_executable(${name} ${name}.cpp ${ARG_SOURCES})
    vel_compile_settings(${name})
    # The address of a test slot is never taken by number: conversions in tests are harmless.
    target_compile_options(${name} PRIVATE -Wno-conversion)
    set_target_properties(${name} PROPERTIES RUNTIME_OUTPUT_DIRECTORY "${PROJECT_BINARY_DIR}/tests")
    target_link_libraries(${name} PRIVATE vel_test_support ${ARG_LIBRARIES})
    if(ARG_SHARED)
        target_link_libraries(${name} PRIVATE VelUIExtra::VelUIExtra)
    elseif(NOT ARG_BARE)
        target_link_libraries(${name} PRIVATE veluiextra_internal)
    endif()
    if(ARG_X11)
        add_test(NAME ${name} COMMAND "${PROJECT_SOURCE_DIR}/tests/support/with-x-server" $<TARGET_FILE:${name}>)
        list(APPEND ARG_LABELS x11)
        # Window managers that compete for the machine lose keys and clicks.
        set_tests_properties(${name} PROPERTIES RESOURCE_LOCK window_manager)
    else()
        add_test(NAME ${name} COMMAND ${name})
        set_tests_properties(${name} PROPERTIES ENVIRONMENT "QT_QPA_PLATFORM=offscreen")
    endif()
    set_property(TEST ${name} APPEND PROPERTY ENVIRONMENT
        "ASAN_OPTIONS=detect_leaks=1:abort_on_error=0"
        "LSAN_OPTIONS=suppressions=${PROJECT_SOURCE_DIR}/tests/support/lsan.supp:print_suppressions=0"
        "UBSAN_OPTIONS=print_stacktrace=1"
        "TSAN_OPTIONS=suppressions=${PROJECT_SOURCE_DIR}/tests/support/tsan.supp")
    set_tests_properties(${name} PROPERTIES TIMEOUT 600 LABELS "${ARG_LABELS}")
endfunction()
