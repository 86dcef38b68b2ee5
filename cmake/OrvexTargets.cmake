# How a floor becomes a target: the same warnings everywhere, headers in a verified file set.

add_library(orvex_build_flags INTERFACE)
target_compile_options(orvex_build_flags INTERFACE
    -Wall -Wextra -Wpedantic -Werror -Wshadow -Wconversion -Wsign-conversion -Wnon-virtual-dtor
    -Woverloaded-virtual -Wformat=2 -Wimplicit-fallthrough -Wundef -Wcast-align)
# g++ 12 takes the inactive string of a variant for an uninitialised one when it optimises.
target_compile_options(orvex_build_flags INTERFACE $<$<CXX_COMPILER_ID:GNU>:-Wno-maybe-uninitialized>)
if(ORVEX_SANITIZE)
    target_compile_options(orvex_build_flags INTERFACE
        -fsanitize=address,undefined -fno-sanitize-recover=all)
    target_link_options(orvex_build_flags INTERFACE -fsanitize=address,undefined)
endif()
if(ORVEX_BUILD_FUZZERS)
    # Everything is watched, so that an input counts as new wherever it leads to something new.
    target_compile_options(orvex_build_flags INTERFACE -fsanitize=fuzzer-no-link)
    target_compile_definitions(orvex_build_flags INTERFACE FUZZING_BUILD_MODE_UNSAFE_FOR_PRODUCTION)
endif()

# What everybody trusts has its lines counted: the generators and the model.
function(orvex_count_coverage)
    if(ORVEX_COVERAGE)
        foreach(target ${ARGN})
            target_compile_options(${target} PRIVATE --coverage -fprofile-update=atomic)
            target_link_options(${target} PUBLIC --coverage)
        endforeach()
    endif()
endfunction()

# What nearly every file reads is read once for the target. Only where ORVEX_PRECOMPILE asks for it: whether a file
# includes what it uses, the builds without say.
set(ORVEX_COMMON_HEADERS
    <algorithm> <array> <chrono> <cmath> <cstdint> <filesystem> <functional> <memory> <optional> <span> <string>
    <string_view> <unordered_map> <utility> <variant> <vector>)
function(orvex_precompile target)
    if(ORVEX_PRECOMPILE)
        target_precompile_headers(${target} PRIVATE ${ORVEX_COMMON_HEADERS} ${ARGN})
    endif()
endfunction()

# orvex_add_floor(TARGET BASE <folder> HEADERS ... SOURCES ... LINKS ...)
# BASE is the one folder the target exports. Every header is also compiled alone by the target
# all_verify_interface_header_sets.
function(orvex_add_floor target)
    cmake_parse_arguments(FLOOR "" "BASE" "HEADERS;SOURCES;LINKS;PRIVATE_LINKS" ${ARGN})
    if(FLOOR_SOURCES)
        add_library(${target} STATIC ${FLOOR_SOURCES})
        set(scope PUBLIC)
    else()
        add_library(${target} INTERFACE)
        set(scope INTERFACE)
    endif()
    target_sources(${target} ${scope} FILE_SET HEADERS BASE_DIRS ${FLOOR_BASE} FILES ${FLOOR_HEADERS})
    set_target_properties(${target} PROPERTIES VERIFY_INTERFACE_HEADER_SETS ON)
    target_link_libraries(${target} ${scope} ${FLOOR_LINKS})
    if(FLOOR_SOURCES)
        target_link_libraries(${target} PRIVATE orvex_build_flags ${FLOOR_PRIVATE_LINKS})
    else()
        target_link_libraries(${target} INTERFACE orvex_build_flags)
    endif()
endfunction()
