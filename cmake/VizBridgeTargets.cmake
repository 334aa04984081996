# vizbridge_add_library(<target> <export name> DIR <folder> [LINKS <targets...>]
#                       [PRIVATE_LINKS <targets...>])
#
# One library from the sources of one folder of the repository; a folder without sources
# gives an interface library. Its headers are reached, in the build tree and once installed,
# as <VizBridge/<folder>/<header>>: in the build tree through a folder of links of the
# target's own, so that a target sees the headers of its own folder and of the targets it
# links, and nothing else.
function(vizbridge_add_library target export_name)
  cmake_parse_arguments(ARG "" "DIR" "LINKS;PRIVATE_LINKS" ${ARGN})
  set(dir ${ARG_DIR})
  file(GLOB sources CONFIGURE_DEPENDS ${PROJECT_SOURCE_DIR}/${dir}/*.cpp)

  set(header_root ${PROJECT_BINARY_DIR}/headers/${target})
  get_filename_component(link_parent ${header_root}/VizBridge/${dir} DIRECTORY)
  file(MAKE_DIRECTORY ${link_parent})
  file(CREATE_LINK ${PROJECT_SOURCE_DIR}/${dir} ${header_root}/VizBridge/${dir} SYMBOLIC)

  if(sources)
    add_library(${target} ${sources})
    set(scope PUBLIC)
    set_target_properties(${target} PROPERTIES
      VERSION ${PROJECT_VERSION} SOVERSION ${PROJECT_VERSION_MAJOR})
    target_link_libraries(${target}
      PRIVATE $<BUILD_INTERFACE:vizbridge_build_flags> ${ARG_PRIVATE_LINKS})
  else()
    add_library(${target} INTERFACE)
    set(scope INTERFACE)
  endif()
  add_library(VizBridge::${export_name} ALIAS ${target})
  set_target_properties(${target} PROPERTIES EXPORT_NAME ${export_name})
  target_include_directories(${target} ${scope}
    $<BUILD_INTERFACE:${header_root}>
    $<INSTALL_INTERFACE:${CMAKE_INSTALL_INCLUDEDIR}>)
  target_link_libraries(${target} ${scope} ${ARG_LINKS})

  install(DIRECTORY ${dir}/ DESTINATION ${CMAKE_INSTALL_INCLUDEDIR}/VizBridge/${dir}
    FILES_MATCHING PATTERN "*.h")
  install(TARGETS ${target} EXPORT VizBridgeTargets
    LIBRARY DESTINATION ${CMAKE_INSTALL_LIBDIR}
    ARCHIVE DESTINATION ${CMAKE_INSTALL_LIBDIR}
    RUNTIME DESTINATION ${CMAKE_INSTALL_BINDIR})
endfunction()
