# What an executable of the Windows edition says of itself: its icon, version and manifest.
find_program(RSVG_CONVERT rsvg-convert REQUIRED)
find_program(ICON_MAKER NAMES convert-im6.q16 convert REQUIRED)

function(quendra_windows_resources target)
  set(folder ${PROJECT_BINARY_DIR}/resources)
  file(MAKE_DIRECTORY ${folder})
  set(QUENDRA_ICON ${folder}/quendra.ico)
  set(images)
  foreach(side 16 24 32 48)
    add_custom_command(
      OUTPUT ${folder}/icon-${side}.png
      COMMAND ${RSVG_CONVERT} -w ${side} -h ${side} -o ${folder}/icon-${side}.png ${PROJECT_SOURCE_DIR}/artwork/quendra.svg
      DEPENDS ${PROJECT_SOURCE_DIR}/artwork/quendra.svg
      VERBATIM)
    list(APPEND images ${folder}/icon-${side}.png)
  endforeach()
  # Bitmaps, not compressed ones, which systems before Vista can't read.
  add_custom_command(OUTPUT ${QUENDRA_ICON} COMMAND ${ICON_MAKER} ${images} ${QUENDRA_ICON} DEPENDS ${images} VERBATIM)
  configure_file(${PROJECT_SOURCE_DIR}/src/app/windows/quendra.rc.in ${folder}/quendra.rc @ONLY)
  set_source_files_properties(${folder}/quendra.rc PROPERTIES OBJECT_DEPENDS
                              "${QUENDRA_ICON};${PROJECT_SOURCE_DIR}/src/app/windows/quendra.manifest")
  target_sources(${target} PRIVATE ${folder}/quendra.rc)
endfunction()
