# The files that come with the program are made by tools that run on the machine that builds: in a build of their own,
# for that machine. They are then in the folder QUABBLE_PROGRAM_FILES, made by the target program_files.
include(ExternalProject)
set(folder ${CMAKE_BINARY_DIR}/program_files)
set(QUABBLE_PROGRAM_FILES ${folder}/bin)
list(TRANSFORM QUABBLE_PROGRAM_FILE_NAMES PREPEND ${QUABBLE_PROGRAM_FILES}/ OUTPUT_VARIABLE made)
if(WIN32)
  set(robot ${QUABBLE_TESTS})  # which plays in the window, from the machine that builds
else()
  set(robot OFF)
endif()
ExternalProject_Add(program_files
  SOURCE_DIR ${CMAKE_SOURCE_DIR}
  BINARY_DIR ${folder}
  PREFIX ${folder}
  CMAKE_ARGS -DCMAKE_BUILD_TYPE=Release -DQUABBLE_FILES_ONLY=ON -DQUABBLE_TESTS=${robot}
  BUILD_BYPRODUCTS ${made}
  BUILD_ALWAYS ON
  INSTALL_COMMAND "")
