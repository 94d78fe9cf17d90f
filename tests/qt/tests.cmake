# SPDX-License-Identifier: MIT
# The tests of the Qt toolkit.
find_package(Qt6 6.4 REQUIRED COMPONENTS Test Widgets)
qz_tests(qt qz::qt_driver qz::engine qz::tools qz::progress qt-host-forms Qt6::Test)
# Some wait for a real clock, so they begin first, and the others run beside them.
set_tests_properties(qt:part-0 qt:part-1 qt:part-2 qt:part-3 PROPERTIES COST 100)
target_sources(qt-tests PRIVATE qt/main.cpp qt/announcements.cpp qt/resources/resources.qrc)
set_target_properties(qt-tests PROPERTIES AUTOUIC ON AUTORCC ON)
add_executable(qt-outliving-test qt/outliving/main.cpp)
target_link_libraries(qt-outliving-test PRIVATE qz::qt_host qz_private)
add_test(NAME qt:outliving COMMAND qt-outliving-test)
set_tests_properties(qt:outliving PROPERTIES ENVIRONMENT ${qz_leaks})
add_test(NAME qt-scenarios COMMAND qz-walkthrough test --toolkit qt ${PROJECT_SOURCE_DIR}/scenarios)
set_tests_properties(qt-scenarios PROPERTIES ENVIRONMENT "QT_QPA_PLATFORM=offscreen;${qz_leaks}" TIMEOUT 1200)

# Storyboards with pictures.
target_sources(storyboard-tests PRIVATE storyboard/qt/pictures_test.cpp)
target_link_libraries(storyboard-tests PRIVATE Qt6::Widgets)

# Needs forms and Qt's form loader, which scripts/foreign-forms installs.
if(TARGET Qt6::UiTools)
  target_compile_definitions(qt-tests PRIVATE QZ_FORMS)
  add_executable(foreign-forms foreign_forms/form_script.cpp foreign_forms/form_trial.cpp
    foreign_forms/main.cpp)
  set_target_properties(foreign-forms PROPERTIES AUTOMOC ON)
  target_link_libraries(foreign-forms PRIVATE qz::qt_host Qt6::UiTools Qt6::Test qz_private)
endif()
# The guide on a screen that is hardly larger than the example's form, with room for a panel beside its fields.
add_test(NAME qt:GuidePictures.OnASmallScreen
  COMMAND qt-tests --gtest_filter=GuidePictures.ShowTheEdgesOfTheScreen)
set_tests_properties(qt:GuidePictures.OnASmallScreen PROPERTIES ENVIRONMENT
  "QT_QPA_PLATFORM=offscreen:configfile=${CMAKE_CURRENT_SOURCE_DIR}/data/small-screen.json;${qz_leaks}")
