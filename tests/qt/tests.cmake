# SPDX-License-Identifier: MIT
# The tests of the Qt toolkit.
find_package(Qt6 6.4 REQUIRED COMPONENTS Test)
qz_tests(qt qz::qt_driver qz::engine qz::tools qz::progress qt-host-forms Qt6::Test)
target_sources(qt-tests PRIVATE qt/main.cpp qt/resources/resources.qrc)
set_target_properties(qt-tests PROPERTIES AUTOUIC ON AUTORCC ON)
add_executable(qt-outliving-test qt/outliving/main.cpp)
target_link_libraries(qt-outliving-test PRIVATE qz::qt_host qz_private)
add_test(NAME qt:outliving COMMAND qt-outliving-test)
set_tests_properties(qt:outliving PROPERTIES ENVIRONMENT ${qz_leaks})
qz_scenario_tests(qt QT_QPA_PLATFORM=offscreen)
