# What every target of ours is compiled with.
add_library(tolvaris_options INTERFACE)
target_include_directories(tolvaris_options INTERFACE ${PROJECT_SOURCE_DIR})
target_compile_features(tolvaris_options INTERFACE cxx_std_20)
target_compile_options(tolvaris_options INTERFACE
  $<$<COMPILE_LANGUAGE:CXX>:-Wall -Wextra -Wpedantic -Wshadow -Wconversion -Werror>)
if(TOLVARIS_SANITIZE)
  # The fuzzer sees which code its inputs reach; its targets alone are linked with it.
  target_compile_options(tolvaris_options INTERFACE -fsanitize=address,undefined,fuzzer-no-link -fno-sanitize-recover=all
    -fno-omit-frame-pointer)
  target_link_options(tolvaris_options INTERFACE -fsanitize=address,undefined)
  target_compile_options(tolvaris_options INTERFACE -Wno-shadow)  # the other builds see what one file hides of itself
endif()
if(WIN32)
  target_compile_options(tolvaris_options INTERFACE $<$<COMPILE_LANGUAGE:CXX>:-ffunction-sections -fdata-sections>)
  # For Windows 7 and later: it tells a program for an older one other sizes of its frames than they have.
  target_link_options(tolvaris_options INTERFACE
    -Wl,--major-subsystem-version,6,--minor-subsystem-version,1,--major-os-version,6,--minor-os-version,1)
  # The same sources give the same programs: no time of the build goes into them.
  target_link_options(tolvaris_options INTERFACE -static -Wl,--gc-sections,--no-insert-timestamp
    $<$<NOT:$<CONFIG:Debug>>:-s>)
endif()

# With sanitizers the sources of a target are compiled some at a time, in half the time: two of one folder have no name
# of their own in common.
function(tolvaris_together name)
  set_target_properties(${name} PROPERTIES UNITY_BUILD ${TOLVARIS_SANITIZE} UNITY_BUILD_BATCH_SIZE 12)
endfunction()

# A static library of all sources of one folder: tolvaris_folder(NAME FOLDER LIBRARIES...).
function(tolvaris_folder name folder)
  file(GLOB sources CONFIGURE_DEPENDS ${PROJECT_SOURCE_DIR}/${folder}/*.cpp)
  if(NOT sources)
    message(FATAL_ERROR "${folder}/ holds no source")
  endif()
  add_library(${name} STATIC ${sources})
  tolvaris_together(${name})
  target_link_libraries(${name} PUBLIC tolvaris_options ${ARGN})
endfunction()
