# A room is a folder of src/ built as one static library. It finds its own headers and those of the rooms that
# it links, and no others: each room's headers are reached through a folder that holds links to that room's
# headers alone, so an include against the arrows does not build.
#
#   quabble_room(engine SOURCES board.cpp ... ROOMS base LIBRARIES PkgConfig::X)
#
# The room platform_sdl is the folder platform/sdl.
function(quabble_room name)
  cmake_parse_arguments(ARG "" "" "SOURCES;ROOMS;LIBRARIES" ${ARGN})
  string(REPLACE "_" "/" folder ${name})
  set(door ${CMAKE_BINARY_DIR}/rooms/${name})
  file(REMOVE_RECURSE ${door})
  file(MAKE_DIRECTORY ${door}/${folder})
  file(GLOB headers CONFIGURE_DEPENDS ${CMAKE_SOURCE_DIR}/src/${folder}/*.hpp)
  foreach(header ${headers})
    get_filename_component(file ${header} NAME)
    file(CREATE_LINK ${header} ${door}/${folder}/${file} SYMBOLIC)
  endforeach()
  list(TRANSFORM ARG_SOURCES PREPEND ${CMAKE_SOURCE_DIR}/src/${folder}/)
  add_library(${name} STATIC ${ARG_SOURCES})
  target_include_directories(${name} PUBLIC ${door})
  if(QUABBLE_SANITIZE)
    target_compile_options(${name} PRIVATE -fsanitize=fuzzer-no-link)  # the fuzz targets see what is reached
  endif()
  target_link_libraries(${name} PUBLIC ${ARG_ROOMS} PRIVATE ${ARG_LIBRARIES})
endfunction()
