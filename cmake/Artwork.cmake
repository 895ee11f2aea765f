# Renders artwork/*.svg, each at its own size and at twice that, into the resources of a target under :/artwork; the
# fonts of artwork/fonts go under :/fonts as they are.
find_program(RSVG_CONVERT rsvg-convert REQUIRED)

function(quendra_artwork target)
  file(GLOB drawings CONFIGURE_DEPENDS ${PROJECT_SOURCE_DIR}/artwork/*.svg)
  set(folder ${PROJECT_BINARY_DIR}/artwork)
  file(MAKE_DIRECTORY ${folder})
  set(list "<RCC>\n<qresource prefix=\"/artwork\">\n")
  set(images)
  foreach(drawing ${drawings})
    get_filename_component(name ${drawing} NAME_WE)
    add_custom_command(
      OUTPUT ${folder}/${name}.png ${folder}/${name}@2x.png
      COMMAND ${RSVG_CONVERT} -o ${folder}/${name}.png ${drawing}
      COMMAND ${RSVG_CONVERT} -z 2 -o ${folder}/${name}@2x.png ${drawing}
      DEPENDS ${drawing}
      VERBATIM)
    list(APPEND images ${folder}/${name}.png ${folder}/${name}@2x.png)
    string(APPEND list "<file>${name}.png</file>\n<file>${name}@2x.png</file>\n")
  endforeach()
  string(APPEND list "</qresource>\n<qresource prefix=\"/fonts\">\n")
  file(GLOB fonts CONFIGURE_DEPENDS ${PROJECT_SOURCE_DIR}/artwork/fonts/*.ttf)
  foreach(font ${fonts})
    get_filename_component(name ${font} NAME)
    string(APPEND list "<file alias=\"${name}\">${font}</file>\n")
  endforeach()
  string(APPEND list "</qresource>\n</RCC>\n")
  file(CONFIGURE OUTPUT ${folder}/artwork.qrc CONTENT "${list}" @ONLY)
  add_custom_command(
    OUTPUT ${folder}/qrc_artwork.cpp
    COMMAND Qt6::rcc --name artwork --no-compress --output ${folder}/qrc_artwork.cpp ${folder}/artwork.qrc
    DEPENDS ${folder}/artwork.qrc ${images} ${fonts}
    VERBATIM)
  target_sources(${target} PRIVATE ${folder}/qrc_artwork.cpp)
endfunction()
