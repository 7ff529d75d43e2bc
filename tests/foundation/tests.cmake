# The foundation tests run under three time zones: date results must never depend on the
# machine's zone. The plain run is pinned to UTC.
set_tests_properties(${layer} PROPERTIES ENVIRONMENT "TZ=UTC")
foreach(_tz America/New_York Asia/Kolkata)
  string(REPLACE "/" "_" _tzname ${_tz})
  add_test(NAME ${layer}_values_tz_${_tzname} COMMAND ${_exe} --gtest_filter=Values*)
  set_tests_properties(${layer}_values_tz_${_tzname} PROPERTIES ENVIRONMENT "TZ=${_tz}" TIMEOUT 600)
endforeach()
