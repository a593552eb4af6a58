# Build-time rendering of SVG art into PNGs, shared by the layout and the
# image-resource folders.
include_guard(GLOBAL)

find_program(RSVG_CONVERT rsvg-convert REQUIRED)
find_program(EDJE_CC edje_cc REQUIRED)

# weather_render_svg(<out png> <svg> <width> <height> [css] [DEPENDS ...])
# Appends the output to the list variable named by WEATHER_RENDERED.
function(weather_render_svg out svg width height)
  cmake_parse_arguments(ARG "" "CSS" "DEPENDS" ${ARGN})
  set(style)
  set(deps ${svg} ${ARG_DEPENDS})
  if(ARG_CSS)
    set(style -s ${ARG_CSS})
    list(APPEND deps ${ARG_CSS})
  endif()
  get_filename_component(dir ${out} DIRECTORY)
  add_custom_command(OUTPUT ${out}
    COMMAND ${CMAKE_COMMAND} -E make_directory ${dir}
    COMMAND ${RSVG_CONVERT} -w ${width} -h ${height} ${style} -o ${out} ${svg}
    DEPENDS ${deps}
    VERBATIM)
  set(${WEATHER_RENDERED} ${${WEATHER_RENDERED}} ${out} PARENT_SCOPE)
endfunction()

# weather_compile_edj(<out edj> <edc> [IMAGE_DIR <dir>] [DEPENDS ...])
# edje_cc writes 0600; other processes and users read the file, so 0644.
function(weather_compile_edj out edc)
  cmake_parse_arguments(ARG "" "IMAGE_DIR" "DEPENDS" ${ARGN})
  get_filename_component(dir ${out} DIRECTORY)
  set(images)
  if(ARG_IMAGE_DIR)
    set(images -id ${ARG_IMAGE_DIR})
  endif()
  add_custom_command(OUTPUT ${out}
    COMMAND ${CMAKE_COMMAND} -E make_directory ${dir}
    COMMAND ${CMAKE_COMMAND} -E env ECORE_NO_SYSTEM_MODULES=1 EINA_LOG_BACKTRACE=0
            ${EDJE_CC} -no-save ${images} ${edc} ${out}
    COMMAND chmod 0644 ${out}
    DEPENDS ${edc} ${ARG_DEPENDS}
    VERBATIM)
endfunction()
