# Language, warnings and sanitizers of every target.

set(CMAKE_CXX_STANDARD 20)
set(CMAKE_CXX_STANDARD_REQUIRED ON)
set(CMAKE_CXX_EXTENSIONS OFF)
set(CMAKE_POSITION_INDEPENDENT_CODE ON)
set(CMAKE_CXX_VISIBILITY_PRESET hidden)
set(CMAKE_VISIBILITY_INLINES_HIDDEN ON)
set(CMAKE_CXX_FLAGS_DEBUG "-O1 -g")

set(CMAKE_LIBRARY_OUTPUT_DIRECTORY "${CMAKE_BINARY_DIR}/lib")
set(CMAKE_RUNTIME_OUTPUT_DIRECTORY "${CMAKE_BINARY_DIR}/bin")
# What the device calls the application's resources: themes and catalogues.
set(CLOCK_RESOURCE_DIR "${CMAKE_BINARY_DIR}/res")

option(CLOCK_UI_SANITIZE "Build with address, leak and undefined-behaviour sanitizers" OFF)

add_compile_options(-Wall -Wextra -Wpedantic -Werror)
if(CLOCK_UI_SANITIZE)
    add_compile_options(-fsanitize=address,undefined -fno-sanitize-recover=undefined -fno-omit-frame-pointer)
    add_link_options(-fsanitize=address,undefined)
endif()

# clock_shared_library(NAME): a shared object that hides what it does not export and has no
# unresolved symbols. Sources: every .cpp of the current folder.
function(clock_shared_library name)
    file(GLOB_RECURSE sources CONFIGURE_DEPENDS "${CMAKE_CURRENT_SOURCE_DIR}/*.cpp")
    add_library(${name} SHARED ${sources})
    set_target_properties(${name} PROPERTIES VERSION ${PROJECT_VERSION} SOVERSION ${PROJECT_VERSION_MAJOR})
    if(NOT CLOCK_UI_SANITIZE)
        target_link_options(${name} PRIVATE -Wl,-z,defs)
    endif()
endfunction()
