# A room is a folder of src/ built as one static library. It finds its own headers and those of the rooms that
# it links, and no others: each room's headers are reached through a folder that holds a link to that room
# alone, so an include against the arrows does not build.
#
#   quabble_room(engine SOURCES board.cpp ... ROOMS base LIBRARIES PkgConfig::X)
function(quabble_room name)
  cmake_parse_arguments(ARG "" "" "SOURCES;ROOMS;LIBRARIES" ${ARGN})
  set(door ${CMAKE_BINARY_DIR}/rooms/${name})
  string(REPLACE "_" "/" folder ${name})  # platform_sdl is platform/sdl
  get_filename_component(parent ${folder} DIRECTORY)
  file(MAKE_DIRECTORY ${door}/${parent})
  file(CREATE_LINK ${CMAKE_SOURCE_DIR}/src/${folder} ${door}/${folder} SYMBOLIC)
  list(TRANSFORM ARG_SOURCES PREPEND ${CMAKE_SOURCE_DIR}/src/${folder}/)
  add_library(${name} STATIC ${ARG_SOURCES})
  target_include_directories(${name} PUBLIC ${door})
  target_link_libraries(${name} PUBLIC ${ARG_ROOMS} PRIVATE ${ARG_LIBRARIES})
endfunction()
