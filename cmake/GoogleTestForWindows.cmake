# GoogleTest from its sources, as the system's package installs them: its library is for the machine that builds. It has
# one thread here, for the compiler's thread model offers none.
set(quendra_gtest /usr/src/googletest/googletest)
set(quendra_gtest_port ${PROJECT_SOURCE_DIR}/tests/standins/googletest)
if(NOT EXISTS ${quendra_gtest}/src/gtest-all.cc)
  message(FATAL_ERROR "The sources of GoogleTest are missing: scripts/setup installs them")
endif()
foreach(part gtest gtest_main)
  string(REPLACE "gtest" "gtest-all" source ${part})
  string(REPLACE "gtest-all_main" "gtest_main" source ${source})
  add_library(quendra_${part} STATIC EXCLUDE_FROM_ALL ${quendra_gtest}/src/${source}.cc)
  target_include_directories(quendra_${part} PUBLIC ${quendra_gtest_port})
  target_include_directories(quendra_${part} SYSTEM PUBLIC ${quendra_gtest}/include PRIVATE ${quendra_gtest})
  target_compile_definitions(quendra_${part} PUBLIC GTEST_IS_THREADSAFE=0)
  add_library(GTest::${part} ALIAS quendra_${part})
endforeach()
target_sources(quendra_gtest PRIVATE ${quendra_gtest_port}/AutoHandle.cpp)
target_link_libraries(quendra_gtest PRIVATE quendra_options)
target_compile_options(quendra_gtest PRIVATE -w) # not our sources
