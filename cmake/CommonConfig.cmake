# SPDX-License-Identifier: GPL-3.0-or-later
include(CheckCXXSourceCompiles)

# The language level, warnings, hardening and Qt defines of every target, in one interface target.
add_library(orv_common_config INTERFACE)
target_compile_features(orv_common_config INTERFACE cxx_std_17)
set(CMAKE_CXX_EXTENSIONS OFF) # also names the language level on every command line, for tools with another default
target_include_directories(orv_common_config INTERFACE ${PROJECT_SOURCE_DIR})

target_compile_definitions(orv_common_config INTERFACE
    QT_DISABLE_DEPRECATED_BEFORE=0x050F00
    QT_NO_CAST_FROM_ASCII
    QT_NO_CAST_TO_ASCII
    QT_NO_NARROWING_CONVERSIONS_IN_CONNECT
    QT_NO_URL_CAST_FROM_STRING
    QT_WARN_DEPRECATED_UP_TO=0x060400 # what was deprecated later has no replacement in the oldest
)
target_compile_options(orv_common_config INTERFACE
    -Wall -Wextra -Wpedantic -Wcast-qual -Wconversion -Wextra-semi -Wnon-virtual-dtor -Wold-style-cast
    -Woverloaded-virtual -Wshadow -Wundef
    $<$<BOOL:${ORV_WARNINGS_AS_ERRORS}>:-Werror>
    -fstack-protector-strong
)
# A distribution's compiler or flags may ask for more of it.
set(CMAKE_REQUIRED_FLAGS -O2)
check_cxx_source_compiles("
    #ifndef _FORTIFY_SOURCE
    #error
    #endif
    int main() {}" ORV_HAS_FORTIFY_SOURCE)
unset(CMAKE_REQUIRED_FLAGS)
if(NOT ORV_HAS_FORTIFY_SOURCE)
    target_compile_definitions(orv_common_config INTERFACE $<$<CONFIG:Release,RelWithDebInfo>:_FORTIFY_SOURCE=2>)
endif()
set(CMAKE_POSITION_INDEPENDENT_CODE ON)
target_link_options(orv_common_config INTERFACE -Wl,-z,relro,-z,now)

if(ORV_SANITIZERS)
    target_compile_options(orv_common_config INTERFACE
        -fsanitize=${ORV_SANITIZERS} -fno-sanitize-recover=all -fno-omit-frame-pointer)
    target_link_options(orv_common_config INTERFACE -fsanitize=${ORV_SANITIZERS})
endif()

# orv_add_library(NAME SOURCES ... LINKS ...): one folder's static library.
function(orv_add_library name)
    cmake_parse_arguments(ARG "" "" "SOURCES;LINKS" ${ARGN})
    add_library(${name} STATIC ${ARG_SOURCES})
    target_link_libraries(${name} PUBLIC orv_common_config ${ARG_LINKS})
endfunction()
