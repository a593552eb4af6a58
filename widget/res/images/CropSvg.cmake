# Copies IN to OUT with the 64x64 view box narrowed to VIEWBOX, so that the
# condition art fills more of its image. Run with cmake -P.
file(READ ${IN} svg)
string(REPLACE "viewBox=\"0 0 64 64\"" "viewBox=\"${VIEWBOX}\"" cropped "${svg}")
if(cropped STREQUAL svg)
  message(FATAL_ERROR "${IN}: no 64x64 view box to narrow")
endif()
file(WRITE ${OUT} "${cropped}")
