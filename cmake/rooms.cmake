# A room is a folder of src/ built as one static library. It finds its own headers and those of the rooms that
# it links, and no others: each room's headers are reached through a folder that holds links to that room's
# headers alone, so an include against the arrows does not build.
#
#   quabble_room(engine SOURCES board.cpp ... ROOMS base LIBRARIES PkgConfig::X)
#
# is called in the room's folder. The target of the room hosts/desktop is hosts_desktop.
function(quabble_room folder)
  cmake_parse_arguments(ARG "" "" "SOURCES;ROOMS;LIBRARIES" ${ARGN})
  string(REPLACE "/" "_" name ${folder})
  set(door ${CMAKE_BINARY_DIR}/rooms/${name})
  file(REMOVE_RECURSE ${door})
  file(MAKE_DIRECTORY ${door}/${folder})
  file(GLOB headers CONFIGURE_DEPENDS ${CMAKE_CURRENT_SOURCE_DIR}/*.hpp)
  foreach(header ${headers})
    get_filename_component(file ${header} NAME)
    file(CREATE_LINK ${header} ${door}/${folder}/${file} SYMBOLIC)
  endforeach()
  add_library(${name} STATIC ${ARG_SOURCES})
  target_include_directories(${name} PUBLIC ${door})
  if(QUABBLE_SANITIZE)
    target_compile_options(${name} PRIVATE -fsanitize=fuzzer-no-link)  # the fuzz targets see what is reached
  endif()
  target_link_libraries(${name} PUBLIC ${ARG_ROOMS} PRIVATE ${ARG_LIBRARIES})
endfunction()

# Makes files part of a target as read-only bytes, one after the other, that begin at a symbol of C. The files may be
# made by the build.
#
#   quabble_embed(draw quabbleFontSans LiberationSans-Regular.ttf)
function(quabble_embed target symbol)
  set(bytes "")
  foreach(file ${ARGN})
    string(APPEND bytes "    .incbin \"${file}\"\n")
  endforeach()
  if(CMAKE_SYSTEM_PROCESSOR MATCHES wasm)
    set(head "    .section .rodata.${symbol},\"\",@\n    .type ${symbol},@object\n")
    set(tail "    .size ${symbol}, . - ${symbol}\n")
  elseif(WIN32)
    set(head "    .section .rdata,\"dr\"\n")
    set(tail "")
  else()
    set(head "    .section .rodata\n")
    set(tail "    .section .note.GNU-stack, \"\", %progbits\n")
  endif()
  set(source ${CMAKE_CURRENT_BINARY_DIR}/${symbol}.S)
  file(CONFIGURE OUTPUT ${source} @ONLY
    CONTENT "@head@    .globl @symbol@\n    .p2align 4\n@symbol@:\n@bytes@@tail@")
  set_property(SOURCE ${source} PROPERTY OBJECT_DEPENDS "${ARGN}")
  target_sources(${target} PRIVATE ${source})
endfunction()
