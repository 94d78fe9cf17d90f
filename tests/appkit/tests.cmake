# SPDX-License-Identifier: MIT
# The tests of the AppKit toolkit. Each of the two programs runs once, with a display of its own, because
# that takes longer to start than all the tests take to run.
file(GLOB sources CONFIGURE_DEPENDS appkit/*_test.mm)
add_executable(appkit-tests ${sources})
target_compile_definitions(appkit-tests PRIVATE QZ_SOURCE_DIR="${PROJECT_SOURCE_DIR}")
target_link_libraries(appkit-tests PRIVATE qz::appkit_driver qz::engine GTest::gtest_main qz_private)
add_test(NAME appkit:tests COMMAND ${PROJECT_SOURCE_DIR}/scripts/with-display $<TARGET_FILE:appkit-tests>)
add_test(NAME appkit-scenarios
  COMMAND ${PROJECT_SOURCE_DIR}/scripts/with-display
    $<TARGET_FILE:qz-walkthrough> test --toolkit appkit ${PROJECT_SOURCE_DIR}/scenarios)
# Tests of other programs that play on every toolkit.
add_test(NAME appkit:witnesses
  COMMAND ${PROJECT_SOURCE_DIR}/scripts/with-display $<TARGET_FILE:check-tests> --gtest_filter=*Witness*)
if(TARGET qt-tests)
  add_test(NAME appkit:rows
    COMMAND ${PROJECT_SOURCE_DIR}/scripts/with-display $<TARGET_FILE:qt-tests> --gtest_filter=ToolkitRows.*)
  set_tests_properties(appkit:rows PROPERTIES ENVIRONMENT "QT_QPA_PLATFORM=offscreen;${qz_leaks}")
endif()
set_tests_properties(appkit:tests appkit:witnesses appkit-scenarios PROPERTIES ENVIRONMENT "${qz_leaks}" TIMEOUT 600)
