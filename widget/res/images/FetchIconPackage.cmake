# Installs the pinned condition-icon package with npm into PREFIX and checks
# that the expected art is there. Run with cmake -P.
set(package_dir ${PREFIX}/node_modules/@bybas/weather-icons)
set(probe ${package_dir}/design/fill/export/wi_clear-day.svg)

if(EXISTS ${package_dir}/package.json AND EXISTS ${probe})
  file(READ ${package_dir}/package.json manifest)
  string(JSON installed GET "${manifest}" version)
  if(installed STREQUAL VERSION)
    file(TOUCH ${STAMP})
    return()
  endif()
endif()

execute_process(
  COMMAND ${NPM} install --no-audit --no-fund --prefix ${PREFIX} @bybas/weather-icons@${VERSION}
  RESULT_VARIABLE result
  OUTPUT_VARIABLE out
  ERROR_VARIABLE err)
if(NOT result EQUAL 0 OR NOT EXISTS ${probe})
  message(FATAL_ERROR
    "Could not install the icon package @bybas/weather-icons@${VERSION} with npm "
    "(exit status: ${result}). The widget's condition icons are rendered from it, "
    "so the build needs the npm registry (https://registry.npmjs.org or a "
    "configured mirror). npm said:\n${err}")
endif()
file(TOUCH ${STAMP})
