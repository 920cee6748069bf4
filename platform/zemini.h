#pragma once

// SimpleIni keeps its implementation behind SI_IMPLEMENTATION; zemini.cpp is the one place
// that compiles it, for the one document type this program uses: 8-bit text, keys compared
// without regard to ASCII case, no character conversion.
#ifndef SI_NO_CONVERSION
#define SI_NO_CONVERSION
#endif
#include <SimpleIni.h>

using ZemIni = CSimpleIniTempl<char, SI_GenericNoCase<char>, SI_ConvertA<char>>;
extern template class CSimpleIniTempl<char, SI_GenericNoCase<char>, SI_ConvertA<char>>;
