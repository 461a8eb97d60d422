# The example package and the scripts around it, tested in Python.
find_package(Python3 3.9 COMPONENTS Interpreter REQUIRED)

add_test(NAME package.ExampleIsReadableAndUsesEveryElement
         COMMAND Python3::Interpreter ${PROJECT_SOURCE_DIR}/scripts/check-example)
foreach(topic checker guide generators presets remake)
  add_test(NAME package.${topic} COMMAND Python3::Interpreter -B ${CMAKE_CURRENT_LIST_DIR}/test_${topic}.py)
  set_tests_properties(package.${topic} PROPERTIES COST 50 TIMEOUT 300) # long ones first: the short ones fill the gaps
endforeach()
add_test(NAME package.export COMMAND Python3::Interpreter -B ${CMAKE_CURRENT_LIST_DIR}/test_export.py $<TARGET_FILE:zel>)
set_tests_properties(package.export PROPERTIES COST 50 TIMEOUT 120)
