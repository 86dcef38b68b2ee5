# Makes a target of a layer: the same warnings everywhere, headers in a verified file set.

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
    # All code is instrumented, so that new behaviour anywhere makes an input worth keeping.
    target_compile_options(orvex_build_flags INTERFACE -fsanitize=fuzzer-no-link)
    target_compile_definitions(orvex_build_flags INTERFACE FUZZING_BUILD_MODE_UNSAFE_FOR_PRODUCTION)
endif()

# Counts executed lines of the generators and the model.
function(orvex_count_coverage)
    if(ORVEX_COVERAGE)
        foreach(target ${ARGN})
            target_compile_options(${target} PRIVATE --coverage -fprofile-update=atomic)
            target_link_options(${target} PUBLIC --coverage)
        endforeach()
    endif()
endfunction()

# Precompiles what nearly every file includes. Only with ORVEX_PRECOMPILE: builds without it check that each file
# includes what it uses.
set(ORVEX_COMMON_HEADERS
    <algorithm> <array> <chrono> <cmath> <cstdint> <filesystem> <functional> <memory> <optional> <span> <string>
    <string_view> <unordered_map> <utility> <variant> <vector>)
function(orvex_precompile target)
    if(ORVEX_PRECOMPILE)
        target_precompile_headers(${target} PRIVATE ${ORVEX_COMMON_HEADERS} ${ARGN})
    endif()
endfunction()

# orvex_add_layer(TARGET LINKS ... PRIVATE_LINKS ...)
# Makes a layer of all .h and .cpp files in and below the current folder, but main.cpp. The layer exports only this
# folder and sees only what it links. The target all_verify_interface_header_sets compiles every header alone that has
# no source of its name: the others are the first thing that their source includes.
function(orvex_add_layer target)
    cmake_parse_arguments(LAYER "" "" "LINKS;PRIVATE_LINKS" ${ARGN})
    file(GLOB_RECURSE headers CONFIGURE_DEPENDS *.h)
    file(GLOB_RECURSE sources CONFIGURE_DEPENDS *.cpp)
    list(FILTER sources EXCLUDE REGEX "/main\\.cpp$")
    set(paired ${sources})
    list(TRANSFORM paired REPLACE "\\.cpp$" ".h")
    set(alone ${headers})
    list(REMOVE_ITEM alone ${paired})
    list(REMOVE_ITEM headers ${alone})
    add_library(${target} STATIC ${sources})
    target_sources(${target} PUBLIC
        FILE_SET HEADERS BASE_DIRS ${CMAKE_CURRENT_SOURCE_DIR} FILES ${alone}
        FILE_SET paired TYPE HEADERS BASE_DIRS ${CMAKE_CURRENT_SOURCE_DIR} FILES ${headers})
    set_target_properties(${target} PROPERTIES VERIFY_INTERFACE_HEADER_SETS ON INTERFACE_HEADER_SETS_TO_VERIFY HEADERS)
    target_link_libraries(${target} PUBLIC ${LAYER_LINKS} PRIVATE orvex_build_flags ${LAYER_PRIVATE_LINKS})
    # A whole layer at once, so its sources must not have local names in common.
    set_target_properties(${target} PROPERTIES UNITY_BUILD ${ORVEX_UNITY} UNITY_BUILD_BATCH_SIZE 0)
    set_property(GLOBAL APPEND PROPERTY ORVEX_LAYERS ${target})
endfunction()

# Links each layer whole into an empty program, which fails where an arrow points up: the symbol is not there.
function(orvex_check_layers)
    get_property(layers GLOBAL PROPERTY ORVEX_LAYERS)
    file(WRITE ${CMAKE_BINARY_DIR}/empty.cpp "int main() {}\n")
    foreach(layer ${layers})
        add_executable(${layer}_alone ${CMAKE_BINARY_DIR}/empty.cpp)
        target_link_libraries(${layer}_alone PRIVATE "$<LINK_LIBRARY:WHOLE_ARCHIVE,${layer}>")
    endforeach()
endfunction()
