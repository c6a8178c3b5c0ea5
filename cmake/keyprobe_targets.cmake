# Compile flags of all targets, and functions that declare targets.

add_library(keyprobe_flags INTERFACE)
target_compile_features(keyprobe_flags INTERFACE cxx_std_20)
target_include_directories(keyprobe_flags INTERFACE "${PROJECT_SOURCE_DIR}")
target_compile_options(
  keyprobe_flags
  INTERFACE -Wall -Wextra -Wpedantic -Wconversion -Wsign-conversion -Wshadow -Wformat=2
            -Wold-style-cast -Wnon-virtual-dtor -Woverloaded-virtual
            # Failure reports name source files by their path from the repository root.
            "-fmacro-prefix-map=${PROJECT_SOURCE_DIR}/=")
if(KEYPROBE_WERROR)
  target_compile_options(keyprobe_flags INTERFACE -Werror)
endif()
if(KEYPROBE_SANITIZE)
  target_compile_options(keyprobe_flags INTERFACE "-fsanitize=${KEYPROBE_SANITIZE}"
                                                  -fno-sanitize-recover=all -fno-omit-frame-pointer)
  target_link_options(keyprobe_flags INTERFACE "-fsanitize=${KEYPROBE_SANITIZE}")
endif()
if(KEYPROBE_COVERAGE)
  target_compile_options(keyprobe_flags INTERFACE --coverage)
  target_link_options(keyprobe_flags INTERFACE --coverage)
endif()

# keyprobe_headers(LIBRARY HEADER...): declares the headers of a library. The target
# all_verify_interface_header_sets compiles each on its own, which proves that it is self-contained.
function(keyprobe_headers library)
  target_sources(${library} INTERFACE FILE_SET HEADERS BASE_DIRS "${PROJECT_SOURCE_DIR}" FILES
                                      ${ARGN})
  set_target_properties(${library} PROPERTIES VERIFY_INTERFACE_HEADER_SETS ON)
endfunction()

# keyprobe_library(NAME SOURCES ... HEADERS ... LINK ...): declares the static library of a folder.
function(keyprobe_library name)
  cmake_parse_arguments(ARG "" "" "SOURCES;HEADERS;LINK" ${ARGN})
  add_library(${name} STATIC ${ARG_SOURCES})
  keyprobe_headers(${name} ${ARG_HEADERS})
  target_link_libraries(${name} PUBLIC keyprobe_flags ${ARG_LINK})
endfunction()

# keyprobe_program(NAME SOURCES ... LINK ...): declares a program, built in bin/, where
# scripts/run looks for it.
function(keyprobe_program name)
  cmake_parse_arguments(ARG "" "" "SOURCES;LINK" ${ARGN})
  add_executable(${name} ${ARG_SOURCES})
  target_link_libraries(${name} PRIVATE keyprobe_flags ${ARG_LINK})
  set_target_properties(${name} PROPERTIES RUNTIME_OUTPUT_DIRECTORY "${PROJECT_BINARY_DIR}/bin")
  if(KEYPROBE_STATIC)
    target_link_options(${name} PRIVATE -static)
  endif()
endfunction()
