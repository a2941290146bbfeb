# Settings that every target of the house shares, and the layout of the build tree: what stands in
# bin/, lib/ and share/ here is what an installation holds under its prefix.

set(CMAKE_CXX_STANDARD 20)
set(CMAKE_CXX_STANDARD_REQUIRED ON)
set(CMAKE_CXX_EXTENSIONS OFF)
set(CMAKE_CXX_VISIBILITY_PRESET hidden)
set(CMAKE_VISIBILITY_INLINES_HIDDEN ON)
set(CMAKE_POSITION_INDEPENDENT_CODE ON)

set(CMAKE_RUNTIME_OUTPUT_DIRECTORY ${CMAKE_BINARY_DIR}/bin)
set(CMAKE_LIBRARY_OUTPUT_DIRECTORY ${CMAKE_BINARY_DIR}/lib)
set(CMAKE_INSTALL_LIBDIR lib)
set(CMAKE_BUILD_RPATH_USE_ORIGIN ON)

add_library(axvelto-settings INTERFACE)
target_include_directories(axvelto-settings INTERFACE ${CMAKE_SOURCE_DIR})
target_compile_options(axvelto-settings INTERFACE -Wall -Wextra -Wpedantic -Werror -Wshadow -Wnon-virtual-dtor
                                                  -Wcast-align -Woverloaded-virtual -fno-plt)
# The module's exported functions return handles, which C does not know and the module's callers do.
target_compile_options(axvelto-settings INTERFACE $<$<CXX_COMPILER_ID:Clang>:-Wno-return-type-c-linkage>)

set(AXVELTO_SANITIZE "" CACHE STRING "Sanitizers to build with, as -fsanitize takes them")
if(AXVELTO_SANITIZE)
  target_compile_options(axvelto-settings INTERFACE -fsanitize=${AXVELTO_SANITIZE} -fno-omit-frame-pointer
                                                    -fno-sanitize-recover=all)
  target_link_options(axvelto-settings INTERFACE -fsanitize=${AXVELTO_SANITIZE})
endif()
if(AXVELTO_FUZZ)
  # Clang compares types by address, which differ between this house's libraries.
  target_compile_options(axvelto-settings INTERFACE -fno-sanitize=function,vptr)
endif()

# What nearly every source includes, read once for each target: a build of everything takes a third less. Sources
# still include what they use, which the other presets and the lints hold.
option(AXVELTO_PRECOMPILE "Precompile the headers that nearly every source includes" OFF)
macro(axvelto_precompile target visibility)
  if(AXVELTO_PRECOMPILE)
    target_precompile_headers(${target} ${visibility} ${ARGN})
  endif()
endmacro()
axvelto_precompile(axvelto-settings INTERFACE <algorithm> <array> <atomic> <cmath> <functional> <map> <memory> <mutex>
                   <optional> <set> <span> <string> <string_view> <unordered_map> <utility> <vector>)

# All sources below this folder, without those of folders that are targets of their own.
macro(axvelto_sources variable)
  file(GLOB_RECURSE ${variable} CONFIGURE_DEPENDS ${CMAKE_CURRENT_SOURCE_DIR}/*.cpp)
endmacro()
