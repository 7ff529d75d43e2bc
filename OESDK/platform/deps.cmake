# Link dependencies of the platform layer: the built-in HTTP client and certificate object.
if(WIN32)
  target_link_libraries(oesdk PRIVATE winhttp crypt32)
else()
  find_package(CURL REQUIRED)
  find_package(OpenSSL REQUIRED)
  target_link_libraries(oesdk PRIVATE CURL::libcurl OpenSSL::SSL OpenSSL::Crypto)
endif()
