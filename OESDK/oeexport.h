// Export macro of the OESDK shared library.
//
// Every class and function of the public object model carries OE_API. On Windows it expands to
// __declspec(dllexport) while the library itself is compiled and to __declspec(dllimport) in a
// host; elsewhere the library is compiled with -fvisibility=hidden and OE_API makes the symbol
// visible again, so both platforms export exactly the same set.
#ifndef OESDK_OEEXPORT_H
#define OESDK_OEEXPORT_H

#if defined(_WIN32)
#if defined(OESDK_BUILDING_DLL)
#define OE_API __declspec(dllexport)
#elif defined(OESDK_STATIC)
#define OE_API
#else
#define OE_API __declspec(dllimport)
#endif
#else
#define OE_API __attribute__((visibility("default")))
#endif

#define OESDK_VERSION_MAJOR 0
#define OESDK_VERSION_MINOR 1
#define OESDK_VERSION_PATCH 0
#define OESDK_VERSION_STRING "0.1.0"

#endif
