# The one way in which folders become targets, and the flags that all of them share.

add_library(penwick_flags INTERFACE)
target_compile_definitions(
  penwick_flags INTERFACE QT_NO_KEYWORDS QT_NO_CAST_FROM_ASCII QT_NO_CAST_TO_ASCII
                          QT_DISABLE_DEPRECATED_BEFORE=0x060400)
target_compile_options(
  penwick_flags INTERFACE -Wall -Wextra -Wpedantic -Wshadow -Wnon-virtual-dtor -Woverloaded-virtual
                          -Wcast-qual -Wformat=2)
if(PENWICK_WARNINGS_AS_ERRORS)
  target_compile_options(penwick_flags INTERFACE -Werror)
endif()
if(PENWICK_SANITIZE)
  target_compile_options(penwick_flags INTERFACE -fsanitize=address,undefined
                                                 -fno-sanitize-recover=all -fno-omit-frame-pointer)
  target_link_options(penwick_flags INTERFACE -fsanitize=address,undefined)
endif()
# Counts which lines and branches run; see docs/testing.md. Of the product alone: the tests' own
# lines would only make them slow.
if(PENWICK_COVERAGE)
  target_link_options(penwick_flags INTERFACE --coverage)
  set(penwick_counts_at_end ${PROJECT_SOURCE_DIR}/tests/support/CountsAtEnd.cpp)
endif()

# penwick_add_module(NAME SOURCES file... [QT component...] [DEPENDS module...] [LIBRARIES target...])
#
# Makes the object library penwick_NAME of one folder under src/. DEPENDS names the modules whose
# headers the folder may include, or whose artwork it shows; a test holds it against the includes.
# SOURCES names the public headers that are the folder's too.
function(penwick_add_module name)
  cmake_parse_arguments(arg "" "" "SOURCES;QT;DEPENDS;LIBRARIES" ${ARGN})
  add_library(penwick_${name} OBJECT ${arg_SOURCES})
  target_compile_definitions(penwick_${name} PRIVATE PENWICK_BUILD)
  target_include_directories(penwick_${name} PUBLIC ${PROJECT_SOURCE_DIR}/include
                                                    ${PROJECT_SOURCE_DIR}/src)
  set_target_properties(penwick_${name} PROPERTIES AUTOUIC_SEARCH_PATHS
                                                   ${PROJECT_SOURCE_DIR}/src/resources/ui)
  list(TRANSFORM arg_QT PREPEND Qt6::)
  target_link_libraries(penwick_${name} PUBLIC penwick_flags ${arg_QT} ${arg_LIBRARIES})
  if(PENWICK_COVERAGE)
    target_compile_options(penwick_${name} PRIVATE --coverage)
  endif()
  set_property(TARGET penwick_${name} PROPERTY PENWICK_DEPENDS ${arg_DEPENDS})
  set_property(GLOBAL APPEND PROPERTY PENWICK_MODULES penwick_${name})
endfunction()

# penwick_link_modules(TARGET module...)
#
# Links modules and, because objects do not travel transitively, all that they depend on.
function(penwick_link_modules target)
  set(wanted ${ARGN})
  set(modules)
  while(wanted)
    list(POP_FRONT wanted module)
    if(NOT module IN_LIST modules)
      list(APPEND modules ${module})
      get_property(depends TARGET penwick_${module} PROPERTY PENWICK_DEPENDS)
      list(APPEND wanted ${depends})
    endif()
  endwhile()
  list(TRANSFORM modules PREPEND penwick_)
  target_link_libraries(${target} PRIVATE ${modules})
endfunction()
