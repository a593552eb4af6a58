# Installs the pinned world-cities npm package into PREFIX and checks that
# its data file is there. Run with cmake -P.
set(package_dir ${PREFIX}/node_modules/city-timezones)
set(data ${package_dir}/data/cityMap.json)

if(EXISTS ${package_dir}/package.json AND EXISTS ${data})
  file(READ ${package_dir}/package.json manifest)
  string(JSON installed GET "${manifest}" version)
  if(installed STREQUAL VERSION)
    file(TOUCH ${STAMP})
    return()
  endif()
endif()

execute_process(
  COMMAND ${NPM} install --no-audit --no-fund --prefix ${PREFIX} city-timezones@${VERSION}
  RESULT_VARIABLE result
  OUTPUT_VARIABLE out
  ERROR_VARIABLE err)
if(NOT result EQUAL 0 OR NOT EXISTS ${data})
  message(FATAL_ERROR
    "Could not install the city package city-timezones@${VERSION} with npm "
    "(exit status: ${result}). The city catalogue of the weather agent and "
    "the weather app is built from it, so the build needs the npm registry "
    "(or a configured mirror). npm said:\n${err}")
endif()
file(TOUCH ${STAMP})
