#define SI_IMPLEMENTATION
#include "zemini.h"

template class CSimpleIniTempl<char, SI_GenericNoCase<char>, SI_ConvertA<char>>;
