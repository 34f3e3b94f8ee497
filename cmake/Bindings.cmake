# openvorla_binding(<manifest> LIBS <host libraries> [SOURCES <hand-written sources>])
#
# Generates an extension module from its manifest with the binding generator
# and builds it into the package directory, linked to its own copy of the
# runtime and to the host libraries it wraps.
file(GLOB_RECURSE CODEGEN_SOURCES CONFIGURE_DEPENDS ${CMAKE_SOURCE_DIR}/codegen/*.py)
file(GLOB_RECURSE HOST_HEADERS CONFIGURE_DEPENDS ${CMAKE_SOURCE_DIR}/host/include/*.h)
# A module's Python types name the classes of the modules sharing its type
# table, so every manifest is an input of every module.
file(GLOB MANIFESTS CONFIGURE_DEPENDS ${CMAKE_SOURCE_DIR}/wrap/*.toml)

function(openvorla_binding manifest)
  cmake_parse_arguments(B "" "" "LIBS;SOURCES" ${ARGN})
  set(manifest_path ${CMAKE_SOURCE_DIR}/${manifest})
  get_filename_component(stem ${manifest} NAME_WE)
  set_property(DIRECTORY APPEND PROPERTY CMAKE_CONFIGURE_DEPENDS
    ${manifest_path} ${CMAKE_SOURCE_DIR}/codegen/__main__.py)

  # The file list depends only on the manifest, so it is known at configure time.
  execute_process(
    COMMAND ${Python3_EXECUTABLE} -m codegen outputs ${manifest_path}
    WORKING_DIRECTORY ${CMAKE_SOURCE_DIR}
    OUTPUT_VARIABLE outputs RESULT_VARIABLE rc OUTPUT_STRIP_TRAILING_WHITESPACE)
  if(rc)
    message(FATAL_ERROR "codegen could not read ${manifest}")
  endif()
  string(REPLACE "\n" ";" outputs "${outputs}")
  set(gen_dir ${CMAKE_BINARY_DIR}/gen/${stem})
  list(TRANSFORM outputs PREPEND ${gen_dir}/)
  set(sources ${outputs})
  list(FILTER sources INCLUDE REGEX "\\.cpp$")

  # The generator rewrites only files whose text changed; the stamp tells
  # Ninja when it last ran, so unchanged sources are not compiled again.
  set(stamp ${gen_dir}/${stem}.stamp)
  add_custom_command(
    OUTPUT ${stamp}
    BYPRODUCTS ${outputs} ${PACKAGE_DIR}/${stem}.py ${PACKAGE_DIR}/${stem}.interface.json
               ${PACKAGE_DIR}/${stem}.pyi ${PACKAGE_DIR}/_${stem}.pyi
    COMMAND ${Python3_EXECUTABLE} -m codegen generate ${manifest_path}
            --include ${CMAKE_SOURCE_DIR}/host/include
            --cxx-out ${gen_dir} --py-out ${PACKAGE_DIR}
    COMMAND ${CMAKE_COMMAND} -E touch ${stamp}
    WORKING_DIRECTORY ${CMAKE_SOURCE_DIR}
    DEPENDS ${MANIFESTS} ${CODEGEN_SOURCES} ${HOST_HEADERS}
    COMMENT "Generating the ${stem} bindings")
  add_custom_target(${stem}_generated DEPENDS ${stamp})

  list(TRANSFORM B_SOURCES PREPEND ${CMAKE_SOURCE_DIR}/)
  Python3_add_library(_${stem} MODULE WITH_SOABI ${sources} ${B_SOURCES})
  add_dependencies(_${stem} ${stem}_generated)
  target_include_directories(_${stem} PRIVATE ${gen_dir}/wrap)
  target_link_libraries(_${stem} PRIVATE vpxruntime ${B_LIBS})
  target_compile_options(_${stem} PRIVATE -Wall -Wextra -Werror)
  set_target_properties(_${stem} PROPERTIES
    LIBRARY_OUTPUT_DIRECTORY ${PACKAGE_DIR}
    CXX_VISIBILITY_PRESET hidden
    VISIBILITY_INLINES_HIDDEN ON
    BUILD_RPATH "\$ORIGIN/../../lib")
endfunction()
