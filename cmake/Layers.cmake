# Each layer folder holds one sub-folder per service or area; sources are
# picked up by glob so that adding a class is adding its files.
function(ct_glob_sources out)
  set(all)
  foreach(dir ${ARGN})
    file(GLOB_RECURSE found CONFIGURE_DEPENDS
      ${dir}/*.c ${dir}/*.cpp ${dir}/*.cc)
    list(APPEND all ${found})
  endforeach()
  set(${out} ${all} PARENT_SCOPE)
endfunction()

# Public include folders of a layer: the layer folder and each direct sub-folder.
function(ct_layer_include_dirs target visibility layer_dir)
  target_include_directories(${target} ${visibility} ${layer_dir})
  file(GLOB children LIST_DIRECTORIES true ${layer_dir}/*)
  foreach(child ${children})
    if(IS_DIRECTORY ${child})
      target_include_directories(${target} ${visibility} ${child})
    endif()
  endforeach()
endfunction()

# ct_add_layer(<target> <SHARED|STATIC> <dir> [LIBS ...])
# A layer with no sources yet is an interface target, so later layers can
# already link against it.
function(ct_add_layer target kind dir)
  cmake_parse_arguments(L "" "" "LIBS" ${ARGN})
  ct_glob_sources(srcs ${dir})
  if(srcs)
    add_library(${target} ${kind} ${srcs})
    ct_layer_include_dirs(${target} PUBLIC ${dir})
    target_link_libraries(${target} PUBLIC ${L_LIBS})
  else()
    add_library(${target} INTERFACE)
    ct_layer_include_dirs(${target} INTERFACE ${dir})
    target_link_libraries(${target} INTERFACE ${L_LIBS})
  endif()
endfunction()
