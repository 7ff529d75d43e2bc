# The transport tests run against a loopback HTTPS server (python3 stdlib) with a test CA made
# by the openssl command-line tool when the fixture starts. The fixture runs natively, also when
# the test executable runs under wine.
find_program(OESDK_PYTHON3 python3)
find_program(OESDK_OPENSSL openssl)
if(NOT OESDK_PYTHON3 OR NOT OESDK_OPENSSL)
  message(FATAL_ERROR "the transport tests need python3 and openssl for their loopback HTTPS server")
endif()
set(_net_fixture_dir ${CMAKE_BINARY_DIR}/net-https-fixture)
add_test(NAME net_https_start COMMAND sh ${CMAKE_CURRENT_SOURCE_DIR}/net/https_fixture.sh start
                                         ${_net_fixture_dir} ${CMAKE_CURRENT_SOURCE_DIR}/net)
add_test(NAME net_https_stop COMMAND sh ${CMAKE_CURRENT_SOURCE_DIR}/net/https_fixture.sh stop ${_net_fixture_dir})
set_tests_properties(net_https_start PROPERTIES FIXTURES_SETUP net_https TIMEOUT 60)
set_tests_properties(net_https_stop PROPERTIES FIXTURES_CLEANUP net_https)
# Proxies never see the loopback traffic.
set_tests_properties(${layer} PROPERTIES FIXTURES_REQUIRED net_https
  ENVIRONMENT "OESDK_NET_FIXTURE=${_net_fixture_dir};no_proxy=*;NO_PROXY=*;http_proxy=;https_proxy=;HTTPS_PROXY=")
# The tool's send command is tested here, against the same server.
target_sources(${_exe} PRIVATE ${PROJECT_SOURCE_DIR}/tools/cmd_send.cpp ${PROJECT_SOURCE_DIR}/tools/support.cpp)
target_include_directories(${_exe} PRIVATE ${PROJECT_SOURCE_DIR}/tools)
