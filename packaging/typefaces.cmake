# Writes down under which licences the program is, which is called `program` there: the file copyright.

# The typefaces that become part of the program are under the licences of the packages that they are in: 1.x under the
# GPL with exceptions, 2.x under the OFL. From Debian 13 on, Sans Narrow is a package of its own, and still 1.x.
set(typeface_built_using "")
foreach(package fonts-liberation fonts-liberation-sans-narrow)
  execute_process(COMMAND dpkg-query -W -f "\${source:Package} (= \${source:Version})" ${package}
    OUTPUT_VARIABLE source ERROR_QUIET)
  if(NOT source)
    continue()
  endif()
  list(APPEND typeface_built_using "${source}")
  list(APPEND typeface_packages ${package})
  if(source MATCHES "= (1:)?2\\.")
    list(APPEND typeface_licences OFL-1.1)
    list(APPEND typeface_spdx OFL-1.1)
    string(APPEND typeface_copyright "           2010 Google Corporation, with Reserved Font Arimo, Tinos and Cousine
           2012 Red Hat, Inc., with Reserved Font Name Liberation
")
  else()
    list(APPEND typeface_licences GPL-2-with-Liberation-exceptions)
    list(APPEND typeface_spdx GPL-2.0-only)
    string(APPEND typeface_copyright "           2007 Red Hat, Inc.
")
  endif()
endforeach()
foreach(licence ${typeface_licences})
  file(READ licences/${licence} text)
  string(APPEND typeface_licence_texts "${text}")
endforeach()
list(JOIN typeface_licences " and " typeface_licences)
list(JOIN typeface_spdx " AND " typeface_spdx)
list(JOIN typeface_packages " and " typeface_packages)
list(JOIN typeface_built_using ", " typeface_built_using)
configure_file(copyright.in copyright @ONLY)
