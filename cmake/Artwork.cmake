# Renders artwork/*.svg, each at its own size and at twice that, into a folder of the build, and lists the files that a
# program carries: the pictures, of which each has its name, with "@2x" behind it for the larger, and the fonts.
find_program(RSVG_CONVERT rsvg-convert REQUIRED)
set(quendra_artwork_folder ${PROJECT_BINARY_DIR}/artwork)

function(quendra_render_artwork images)
  file(GLOB drawings CONFIGURE_DEPENDS ${PROJECT_SOURCE_DIR}/artwork/*.svg)
  set(folder ${quendra_artwork_folder})
  file(MAKE_DIRECTORY ${folder})
  set(rendered)
  foreach(drawing ${drawings})
    get_filename_component(name ${drawing} NAME_WE)
    add_custom_command(
      OUTPUT ${folder}/${name}.png ${folder}/${name}@2x.png
      COMMAND ${RSVG_CONVERT} -o ${folder}/${name}.png ${drawing}
      COMMAND ${RSVG_CONVERT} -z 2 -o ${folder}/${name}@2x.png ${drawing}
      DEPENDS ${drawing}
      VERBATIM)
    list(APPEND rendered ${folder}/${name}.png ${folder}/${name}@2x.png)
  endforeach()
  set(${images} ${rendered} PARENT_SCOPE)
endfunction()

# Into the resources of Qt: pictures under :/artwork, fonts under :/fonts as they are.
function(quendra_artwork target)
  set(folder ${quendra_artwork_folder})
  quendra_render_artwork(images)
  set(list "<RCC>\n<qresource prefix=\"/artwork\">\n")
  foreach(image ${images})
    get_filename_component(name ${image} NAME)
    string(APPEND list "<file>${name}</file>\n")
  endforeach()
  string(APPEND list "</qresource>\n<qresource prefix=\"/fonts\">\n")
  file(GLOB fonts CONFIGURE_DEPENDS ${PROJECT_SOURCE_DIR}/artwork/fonts/Noto*.ttf)
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

# Into a source of the Windows edition, which the assembler fills with the files' bytes.
function(quendra_artwork_for_windows target)
  set(source ${quendra_artwork_folder}/AllResources.cpp)
  quendra_render_artwork(files)
  file(GLOB fonts CONFIGURE_DEPENDS ${PROJECT_SOURCE_DIR}/artwork/fonts/Quendra*.ttf)
  list(APPEND files ${fonts})
  set(bytes)
  set(names)
  set(rows)
  set(count 0)
  foreach(path ${files})
    get_filename_component(name ${path} NAME)
    string(REGEX REPLACE "\\.png$" "" name ${name})
    string(APPEND bytes "    \"_quendraResource${count}:\\n .incbin \\\"${path}\\\"\\n\"\n")
    math(EXPR next "${count} + 1")
    string(APPEND names "extern \"C\" const std::uint8_t quendraResource${count}[];\n")
    string(APPEND rows "    {\"${name}\", quendraResource${count}, quendraResource${next}},\n")
    set(count ${next})
  endforeach()
  file(CONFIGURE OUTPUT ${source} CONTENT [[// Written by cmake/Artwork.cmake.
#include "forms/win32/drawing/Resources.h"

asm(".section .rdata,\"dr\"\n"
@bytes@    "_quendraResource@count@:\n .byte 0\n .text\n");
@names@extern "C" const std::uint8_t quendraResource@count@[];

namespace quendra::forms::win32 {

std::span<const Resource> AllResources() {
  static const Resource kAll[] = {
@rows@  };
  return kAll;
}

} // namespace quendra::forms::win32
]] @ONLY)
  set_source_files_properties(${source} PROPERTIES OBJECT_DEPENDS "${files}")
  target_sources(${target} PRIVATE ${source})
endfunction()
