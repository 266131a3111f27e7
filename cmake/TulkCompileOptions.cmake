# Warnings and sanitizers shared by every target of the project.
add_library(tulk_options INTERFACE)
target_compile_options(tulk_options INTERFACE -Wall -Wextra -Wshadow -Wnon-virtual-dtor
  -Wold-style-cast -Woverloaded-virtual -Wformat=2)
if(TULK_WERROR)
  target_compile_options(tulk_options INTERFACE -Werror)
endif()
if(TULK_SANITIZE)
  target_compile_options(tulk_options INTERFACE -fsanitize=address,undefined
    -fno-sanitize-recover=undefined -fno-omit-frame-pointer)
  target_link_options(tulk_options INTERFACE -fsanitize=address,undefined)
endif()
if(NOT TULK_SANITIZE)
  # Lets the linker drop unused functions from the console binary.
  target_compile_options(tulk_options INTERFACE -ffunction-sections -fdata-sections)
endif()
# Every source file sees the project's own headers by folder name, for
# example #include "runtime/KeyInput.h".
target_include_directories(tulk_options INTERFACE ${PROJECT_SOURCE_DIR}/src)
target_compile_definitions(tulk_options INTERFACE _GNU_SOURCE NCURSES_WIDECHAR=1)

# tulk_add_layer(<folder> [DEPS <targets>...])
# One library per source folder, named tulk_<folder>, built from the
# folder's .cpp files. The DEPS give the one-way links between layers.
function(tulk_add_layer folder)
  cmake_parse_arguments(LAYER "" "" "DEPS" ${ARGN})
  file(GLOB sources CONFIGURE_DEPENDS ${CMAKE_CURRENT_SOURCE_DIR}/${folder}/*.cpp)
  if(sources)
    add_library(tulk_${folder} STATIC ${sources})
    target_link_libraries(tulk_${folder} PUBLIC tulk_options ${LAYER_DEPS})
  else()
    add_library(tulk_${folder} INTERFACE)
    target_link_libraries(tulk_${folder} INTERFACE tulk_options ${LAYER_DEPS})
  endif()
endfunction()
