// VantorBase: export macros.
//
// VANTORBASE_API marks the classes, functions and data that VantorBase.dll
// exports. While the library itself is built (VANTORBASE_BUILDING defined) it
// expands to dllexport; for every caller it expands to dllimport.
#ifndef VANTORBASE_EXPORT_H
#define VANTORBASE_EXPORT_H

#if defined(_WIN32)
#  if defined(VANTORBASE_BUILDING)
#    define VANTORBASE_API __declspec(dllexport)
#  else
#    define VANTORBASE_API __declspec(dllimport)
#  endif
#else
#  define VANTORBASE_API
#endif

// Exported classes hold standard-library members; MSVC warns that those need
// a DLL interface too, which is harmless when caller and library share one
// compiler and runtime, as they must for any C++ DLL interface.
#if defined(_MSC_VER)
#  define VANTORBASE_SUPPRESS_DLL_INTERFACE_WARNINGS \
       __pragma(warning(push)) __pragma(warning(disable : 4251 4275))
#  define VANTORBASE_RESTORE_WARNINGS __pragma(warning(pop))
#else
#  define VANTORBASE_SUPPRESS_DLL_INTERFACE_WARNINGS
#  define VANTORBASE_RESTORE_WARNINGS
#endif

#endif  // VANTORBASE_EXPORT_H
