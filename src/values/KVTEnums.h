// KVTEnums.h - export decoration and result codes of the value-types module ValueTypesU.dll.
#pragma once

#ifndef KVT_API
#ifdef KVT_BUILDING_VALUETYPES
#define KVT_API __declspec(dllexport)
#else
#define KVT_API __declspec(dllimport)
#endif
#endif

// Result of KVXString::GetAs: how a text converts into a long or a double.
enum KVTEnumConvertType
{
    KVT_CONVERT_OK             =  0,  // converted, value stored
    KVT_CONVERT_NOT_SUPPORTED  = -1,  // no conversion into the requested type exists (never for long, double)
    KVT_CONVERT_BAD_ARGUMENT   = -2,  // the source cannot be read (never for a KVXString)
    KVT_CONVERT_SYNTAX_ERROR   = -3,  // errorPos = index of the offending character
    KVT_CONVERT_UNDERFLOW      = -4,  // below the type's range (more negative than its lowest value)
    KVT_CONVERT_OVERFLOW       = -5,  // above the type's range
    KVT_CONVERT_PRECISION_LOSS = -6,  // a nonzero number too close to 0 for the type: it would become 0
    KVT_CONVERT_NOT_A_NUMBER   = -7   // no number at all: empty, only a sign or prefix, "nan", "inf"
};

// Result of KVXVariant::GetAs: how the held value converts into the requested type.
enum KVTEnumVariantError
{
    KVT_VARIANT_OK            =  0,  // converted, value stored
    KVT_VARIANT_TYPE_MISMATCH = -1,  // the held type has no such conversion (VT_NULL, objects, arrays)
    KVT_VARIANT_OVERFLOW      = -2,  // the value lies outside the requested type's range
    KVT_VARIANT_NOT_A_NUMBER  = -3,  // held text that the number grammar rejects, or a NaN
    KVT_VARIANT_FAILED        = -4   // the system conversion failed otherwise
};
