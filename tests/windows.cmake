# What only the Windows edition has: the suites over its backends, the program as it is shipped, and its installer.
quendra_test(winapi quendra_winapi quendra_runtime)
add_subdirectory(standins/windows)
add_subdirectory(architecture/windows)
target_link_libraries(platform_test PRIVATE quendra_platform_windows)
target_link_libraries(provisioning_test PRIVATE quendra_platform_windows)
target_sources(provisioning_test PRIVATE platform/windows/WindowsLoopFixture.cpp
                                         platform/windows/remote_access/StandInRemoteAccessFixture.cpp)
foreach(test platform_test provisioning_test)
  add_dependencies(${test} standin_rasapi32) # which it loads
endforeach()
target_link_libraries(foundation_test PRIVATE quendra_platform_windows ws2_32)
target_sources(foundation_test PRIVATE platform/windows/WindowsLoopFixture.cpp platform/windows/WineDeviationsTest.cpp)
add_subdirectory(standins/windows/wpcap)
add_dependencies(platform_test standin_wpcap) # which it loads
quendra_test(standins/windows quendra_window_reading quendra_platform_windows comctl32)
target_sources(standins_windows_test PRIVATE app/windows/TestFolderFixture.cpp)
add_dependencies(standins_windows_test standin_wpcap) # likewise
quendra_test(forms/win32 quendra_forms_win32)
if(TARGET forms_win32_test)
  target_sources(forms_win32_test PRIVATE ${desktop_suite})
endif()
# The program itself, as it is shipped, and the same with its forms on the screen of the bed.
quendra_test(app/windows quendra_app quendra_forms_win32 quendra_platform_windows)
set(as_shipped ${CMAKE_CURRENT_BINARY_DIR}/as_shipped.rc)
file(GENERATE OUTPUT ${as_shipped} CONTENT "1 24 \"${PROJECT_SOURCE_DIR}/src/app/windows/quendra.manifest\"\n")
# Thousands of passes and changes of the page, and times that are taken.
set_tests_properties(app/windows/part_1 PROPERTIES TIMEOUT 1200 RUN_SERIAL TRUE)
target_sources(app_windows_test PRIVATE forms/win32/Win32DriverFixture.cpp ${as_shipped})
add_subdirectory(app/windows/programs)
add_dependencies(platform_test idle_program) # which it starts
add_subdirectory(standins/windows/planted)
add_dependencies(app_windows_test quendra_windows standin_planted standin_careless standin_wpcap timed_start idle_program
                 odd_program port_talker loopback_recorder)
# The installer runs in the bed as on a machine of a subscriber.
add_subdirectory(${PROJECT_SOURCE_DIR}/packaging/windows ${CMAKE_BINARY_DIR}/packaging)
quendra_test(packaging/windows quendra_winapi quendra_runtime)
target_compile_definitions(packaging_windows_test PRIVATE QUENDRA_INSTALLER="quendra-${PROJECT_VERSION}-setup.exe")
target_sources(packaging_windows_test PRIVATE app/windows/StartedProgramFixture.cpp app/windows/TestFolderFixture.cpp)
target_link_libraries(packaging_windows_test PRIVATE quendra_platform_windows)
add_dependencies(packaging_windows_test quendra_installer)
