# Where `cmake --install` puts each kind of file. The prefix is relocatable:
# programs find the platform library through an $ORIGIN run path and
# platform-setup finds the resources relative to its own program.
include(GNUInstallDirs)

# The platform library is ours alone, so it stays out of the linker's
# search path (Debian keeps such libraries in <libdir>/<package>).
set(WEATHER_INSTALL_PRIVATE_LIBDIR ${CMAKE_INSTALL_LIBDIR}/${PROJECT_NAME})
# Laid out as the build tree's res folder: <app id>/res, <app id>/shared/res.
set(WEATHER_INSTALL_DATADIR ${CMAKE_INSTALL_DATADIR}/${PROJECT_NAME})
set(WEATHER_INSTALL_RES_ROOT ${WEATHER_INSTALL_DATADIR}/res)
set(WEATHER_INSTALL_WIDGET_RES_DIR ${WEATHER_INSTALL_RES_ROOT}/com.quorvex.weather-m-widget/res)
set(WEATHER_INSTALL_APP_SHARED_RES_DIR ${WEATHER_INSTALL_RES_ROOT}/com.quorvex.weather-m/shared/res)

# Paths from the program folder, taken between the full paths so that an
# absolute CMAKE_INSTALL_<dir> still gives a relative answer.
file(RELATIVE_PATH WEATHER_BIN_TO_PRIVATE_LIBDIR ${CMAKE_INSTALL_FULL_BINDIR}
     ${CMAKE_INSTALL_FULL_LIBDIR}/${PROJECT_NAME})
file(RELATIVE_PATH WEATHER_BIN_TO_DATADIR ${CMAKE_INSTALL_FULL_BINDIR}
     ${CMAKE_INSTALL_FULL_DATADIR}/${PROJECT_NAME})
set(WEATHER_BIN_TO_RES_ROOT ${WEATHER_BIN_TO_DATADIR}/res)

# weather_install_programs(target...): into the program folder, with a run
# path that reaches the platform library from wherever the prefix is moved.
function(weather_install_programs)
  foreach(target ${ARGN})
    set_target_properties(${target} PROPERTIES INSTALL_RPATH "$ORIGIN/${WEATHER_BIN_TO_PRIVATE_LIBDIR}")
  endforeach()
  install(TARGETS ${ARGN} RUNTIME DESTINATION ${CMAKE_INSTALL_BINDIR})
endfunction()
