# Installs the pinned npm package PACKAGE@VERSION into PREFIX and checks that
# PROBE (a file inside the package) is there; touches STAMP when done. An
# installed package of that version is kept. PURPOSE says in the error what
# the build makes from it. Run with cmake -P.
set(package_dir ${PREFIX}/node_modules/${PACKAGE})
set(probe ${package_dir}/${PROBE})

if(EXISTS ${package_dir}/package.json AND EXISTS ${probe})
  file(READ ${package_dir}/package.json manifest)
  string(JSON installed GET "${manifest}" version)
  if(installed STREQUAL VERSION)
    file(TOUCH ${STAMP})
    return()
  endif()
endif()

execute_process(
  COMMAND ${NPM} install --no-audit --no-fund --prefix ${PREFIX} ${PACKAGE}@${VERSION}
  RESULT_VARIABLE result
  OUTPUT_VARIABLE out
  ERROR_VARIABLE err)
if(NOT result EQUAL 0 OR NOT EXISTS ${probe})
  message(FATAL_ERROR
    "Could not install ${PACKAGE}@${VERSION} with npm (exit status: ${result}). "
    "${PURPOSE}, so the build needs the npm registry (or a configured mirror). "
    "npm said:\n${err}")
endif()
file(TOUCH ${STAMP})
