# The public headers of the library: what a host includes. Each family names its own
# set; those are installed into include/OrvaneControls and copied into the build tree's
# include/OrvaneControls. Every other header of a family folder is internal, and no
# public header may include one (tests/install compiles each public header alone
# against an install tree).

include(GNUInstallDirs)
set(ORVANE_INSTALL_INCLUDEDIR ${CMAKE_INSTALL_INCLUDEDIR}/OrvaneControls)
set(ORVANE_INSTALL_CMAKEDIR ${CMAKE_INSTALL_LIBDIR}/cmake/OrvaneControls)

# orvane_public_headers(<folder> <header>...)
# Headers are named relative to <folder>, itself relative to the calling directory.
function(orvane_public_headers folder)
  set(paths)
  foreach(header ${ARGN})
    set(path ${CMAKE_CURRENT_SOURCE_DIR}/${folder}/${header})
    if(NOT EXISTS ${path})
      message(FATAL_ERROR "public header ${folder}/${header} does not exist")
    endif()
    list(APPEND paths ${path})
  endforeach()
  install(FILES ${paths} DESTINATION ${ORVANE_INSTALL_INCLUDEDIR})
  set_property(GLOBAL APPEND PROPERTY ORVANE_PUBLIC_HEADERS ${paths})
endfunction()
