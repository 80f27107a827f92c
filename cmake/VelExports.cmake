# SPDX-FileCopyrightText: The veluiextra developers
# SPDX-License-Identifier: LGPL-2.1-or-later

# vel_export_only(<target> [CLASSES <name>...] [FUNCTIONS <name>...])
#
# The shared library exports these classes (or namespaces) and functions and nothing else: templates of
# other libraries, which the compiler instantiates here, stay inside. What is exported carries the
# version <NAME>_<major>, so that two majors of the library can live in one process.
function(vel_export_only target)
    cmake_parse_arguments(ARG "" "" "CLASSES;FUNCTIONS" ${ARGN})
    # The sanitizers export what they check types by.
    if(VEL_SANITIZE)
        return()
    endif()
    set(patterns)
    foreach(class ${ARG_CLASSES})
        string(APPEND patterns
            "            ${class}::*;\n"
            "            non-virtual?thunk?to?${class}::*;\n"
            "            typeinfo?for?${class};\n"
            "            typeinfo?name?for?${class};\n"
            "            vtable?for?${class};\n")
    endforeach()
    foreach(function ${ARG_FUNCTIONS})
        string(APPEND patterns "            ${function};\n            ${function}*;\n")
    endforeach()
    get_target_property(file_name ${target} OUTPUT_NAME)
    if(NOT file_name)
        set(file_name ${target})
    endif()
    string(TOUPPER "${file_name}_${PROJECT_VERSION_MAJOR}" node)
    string(REPLACE "-" "_" node "${node}")
    set(script "${CMAKE_CURRENT_BINARY_DIR}/${target}.map")
    file(CONFIGURE OUTPUT "${script}" CONTENT
        "${node} {\n    global:\n        extern \"C++\" {\n${patterns}        };\n    local:\n        *;\n};\n" @ONLY)
    target_link_options(${target} PRIVATE "LINKER:--version-script=${script}")
    set_property(TARGET ${target} APPEND PROPERTY LINK_DEPENDS "${script}")
endfunction()
