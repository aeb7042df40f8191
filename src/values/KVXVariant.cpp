// KVXVariant.cpp - an owned OLE VARIANT with the conversions the edits need.
#include "KVXVariant.h"

#include <charconv>
#include <cmath>
#include <cstdint>
#include <cstring>
#include <system_error>

#include "NumberText.h"

namespace
{

// Copies src into dest (dest must be clear); only running out of memory is an exception.
void CopyVariant(VARIANT& dest, const VARIANT& src)
{
    HRESULT hr = ::VariantCopy(&dest, const_cast<VARIANT*>(&src));
    if (hr == E_OUTOFMEMORY)
        AfxThrowMemoryException();
    if (FAILED(hr))
        ::VariantInit(&dest);
}

// A by-reference variant is converted through a copy of the value it points to.
class DirectValue
{
public:
    explicit DirectValue(const VARIANT& var) : m_pVar(&var)
    {
        ::VariantInit(&m_copy);
        if ((var.vt & VT_BYREF) != 0 &&
            SUCCEEDED(::VariantCopyInd(&m_copy, const_cast<VARIANT*>(&var))))
            m_pVar = &m_copy;
    }
    ~DirectValue() { ::VariantClear(&m_copy); }
    DirectValue(const DirectValue&) = delete;
    DirectValue& operator=(const DirectValue&) = delete;

    const VARIANT& Get() const { return *m_pVar; }

private:
    const VARIANT* m_pVar;
    VARIANT m_copy;
};

KVTEnumVariantError FromConvert(KVTEnumConvertType code)
{
    switch (code)
    {
    case KVT_CONVERT_OK:
        return KVT_VARIANT_OK;
    case KVT_CONVERT_UNDERFLOW:
    case KVT_CONVERT_OVERFLOW:
    case KVT_CONVERT_PRECISION_LOSS:
        return KVT_VARIANT_OVERFLOW;
    default:
        return KVT_VARIANT_NOT_A_NUMBER;
    }
}

KVTEnumVariantError FromHResult(HRESULT hr)
{
    if (SUCCEEDED(hr))
        return KVT_VARIANT_OK;
    if (hr == DISP_E_OVERFLOW)
        return KVT_VARIANT_OVERFLOW;
    if (hr == DISP_E_TYPEMISMATCH || hr == DISP_E_BADVARTYPE)
        return KVT_VARIANT_TYPE_MISMATCH;
    return KVT_VARIANT_FAILED;
}

KVTEnumVariantError RoundToLong(double value, long& lValue)
{
    if (std::isnan(value))
        return KVT_VARIANT_NOT_A_NUMBER;
    double rounded = std::nearbyint(value);  // default rounding: nearest, halves to even
    if (!(rounded >= -2147483648.0 && rounded <= 2147483647.0))
        return KVT_VARIANT_OVERFLOW;
    lValue = long(rounded);
    return KVT_VARIANT_OK;
}

// Integer types are converted here, exactly, rather than by VariantChangeType, whose range
// checks differ between platforms. An unsigned 64-bit value above INT64_MAX sets bTooBig.
bool ReadInteger(const VARIANT& var, int64_t& value, bool& bTooBig)
{
    bTooBig = false;
    switch (var.vt)
    {
    case VT_I1: value = var.cVal; return true;
    case VT_UI1: value = var.bVal; return true;
    case VT_I2: value = var.iVal; return true;
    case VT_UI2: value = var.uiVal; return true;
    case VT_I4: value = var.lVal; return true;
    case VT_UI4: value = var.ulVal; return true;
    case VT_INT: value = var.intVal; return true;
    case VT_UINT: value = var.uintVal; return true;
    case VT_I8: value = var.llVal; return true;
    case VT_UI8:
        bTooBig = var.ullVal > uint64_t(INT64_MAX);
        value = bTooBig ? INT64_MAX : int64_t(var.ullVal);
        return true;
    default:
        return false;
    }
}

KVXString BstrText(BSTR bstr)
{
    return bstr != NULL ? KVXString(bstr, int(::SysStringLen(bstr))) : KVXString();
}

KVXString ShortestFloatText(float value)
{
    char text[KVT_NUMBER_TEXT_MAX];
    if (!std::isfinite(value))
    {
        wchar_t wide[KVT_NUMBER_TEXT_MAX];
        KvtFormatDouble(value, wide, KVT_NUMBER_TEXT_MAX);
        return KVXString(wide);
    }
    std::to_chars_result result = std::to_chars(text, text + sizeof(text) - 1, value);
    *result.ptr = 0;
    return KVXString(text);
}

} // namespace

bool KvtVariantEqual(const VARIANT& var1, const VARIANT& var2)
{
    if (var1.vt != var2.vt)
        return false;
    if ((var1.vt & VT_ARRAY) != 0 || (var1.vt & VT_BYREF) != 0)
        return var1.byref == var2.byref;  // the same array or referenced value
    switch (var1.vt)
    {
    case VT_EMPTY:
    case VT_NULL:
        return true;
    case VT_BOOL:
        return var1.boolVal == var2.boolVal;
    case VT_I1:
        return var1.cVal == var2.cVal;
    case VT_UI1:
        return var1.bVal == var2.bVal;
    case VT_I2:
        return var1.iVal == var2.iVal;
    case VT_UI2:
        return var1.uiVal == var2.uiVal;
    case VT_I4:
        return var1.lVal == var2.lVal;
    case VT_UI4:
        return var1.ulVal == var2.ulVal;
    case VT_INT:
        return var1.intVal == var2.intVal;
    case VT_UINT:
        return var1.uintVal == var2.uintVal;
    case VT_I8:
        return var1.llVal == var2.llVal;
    case VT_UI8:
        return var1.ullVal == var2.ullVal;
    case VT_R4:
        return var1.fltVal == var2.fltVal;
    case VT_R8:
        return var1.dblVal == var2.dblVal;
    case VT_DATE:
        return var1.date == var2.date;
    case VT_CY:
        return var1.cyVal.int64 == var2.cyVal.int64;
    case VT_ERROR:
        return var1.scode == var2.scode;
    case VT_DECIMAL:
        return ::VarDecCmp(const_cast<DECIMAL*>(&var1.decVal),
                           const_cast<DECIMAL*>(&var2.decVal)) == VARCMP_EQ;
    case VT_BSTR:
    {
        UINT bytes = ::SysStringByteLen(var1.bstrVal);
        return bytes == ::SysStringByteLen(var2.bstrVal) &&
               (bytes == 0 || std::memcmp(var1.bstrVal, var2.bstrVal, bytes) == 0);
    }
    case VT_DISPATCH:
    case VT_UNKNOWN:
        return var1.punkVal == var2.punkVal;
    default:
        return false;
    }
}

/////////////////////////////////////////////////////////////////////////////
// Construction and assignment

KVXVariant::KVXVariant()
{
    ::VariantInit(&m_var);
}

KVXVariant::KVXVariant(long lSrc)
{
    ::VariantInit(&m_var);
    m_var.vt = VT_I4;
    m_var.lVal = lSrc;
}

KVXVariant::KVXVariant(int nSrc) : KVXVariant(long(nSrc)) {}

KVXVariant::KVXVariant(double dblSrc)
{
    ::VariantInit(&m_var);
    m_var.vt = VT_R8;
    m_var.dblVal = dblSrc;
}

KVXVariant::KVXVariant(const KVXString& strSrc)
{
    ::VariantInit(&m_var);
    *this = strSrc;
}

KVXVariant::KVXVariant(const VARIANT& varSrc)
{
    ::VariantInit(&m_var);
    CopyVariant(m_var, varSrc);
}

KVXVariant::KVXVariant(const KVXVariant& varSrc)
{
    ::VariantInit(&m_var);
    CopyVariant(m_var, varSrc.m_var);
}

KVXVariant::~KVXVariant()
{
    ::VariantClear(&m_var);
}

void KVXVariant::Clear()
{
    ::VariantClear(&m_var);
}

const KVXVariant& KVXVariant::operator=(long lSrc)
{
    Clear();
    m_var.vt = VT_I4;
    m_var.lVal = lSrc;
    return *this;
}

const KVXVariant& KVXVariant::operator=(int nSrc)
{
    return *this = long(nSrc);
}

const KVXVariant& KVXVariant::operator=(double dblSrc)
{
    Clear();
    m_var.vt = VT_R8;
    m_var.dblVal = dblSrc;
    return *this;
}

const KVXVariant& KVXVariant::operator=(const KVXString& strSrc)
{
    BSTR bstr = strSrc.AllocSysString();  // throws when out of memory, before anything changes
    Clear();
    m_var.vt = VT_BSTR;
    m_var.bstrVal = bstr;
    return *this;
}

const KVXVariant& KVXVariant::operator=(const VARIANT& varSrc)
{
    if (&varSrc != &m_var)
    {
        Clear();
        CopyVariant(m_var, varSrc);
    }
    return *this;
}

const KVXVariant& KVXVariant::operator=(const KVXVariant& varSrc)
{
    return *this = varSrc.m_var;
}

/////////////////////////////////////////////////////////////////////////////
// Comparison

bool KVXVariant::operator==(const KVXVariant& varSrc) const
{
    return KvtVariantEqual(m_var, varSrc.m_var);
}

bool KVXVariant::operator!=(const KVXVariant& varSrc) const
{
    return !KvtVariantEqual(m_var, varSrc.m_var);
}

/////////////////////////////////////////////////////////////////////////////
// Conversion

KVTEnumVariantError KVXVariant::GetAs(long& lValue, short nFlags) const
{
    DirectValue direct(m_var);
    const VARIANT& var = direct.Get();
    switch (var.vt)
    {
    case VT_EMPTY:
        lValue = 0;
        return KVT_VARIANT_OK;
    case VT_R8:
        return RoundToLong(var.dblVal, lValue);
    case VT_R4:
        return RoundToLong(var.fltVal, lValue);
    case VT_BSTR:
    {
        int nErrorPos;
        return FromConvert(KvtParseLong(var.bstrVal, int(::SysStringLen(var.bstrVal)), lValue, nErrorPos));
    }
    default:
    {
        int64_t integer;
        bool bTooBig;
        if (ReadInteger(var, integer, bTooBig))
        {
            if (bTooBig || integer < INT32_MIN || integer > INT32_MAX)
                return KVT_VARIANT_OVERFLOW;
            lValue = long(integer);
            return KVT_VARIANT_OK;
        }
        VARIANT result;
        ::VariantInit(&result);
        HRESULT hr = ::VariantChangeType(&result, const_cast<VARIANT*>(&var), USHORT(nFlags), VT_I4);
        if (SUCCEEDED(hr))
            lValue = result.lVal;
        ::VariantClear(&result);
        return FromHResult(hr);
    }
    }
}

KVTEnumVariantError KVXVariant::GetAs(double& dValue) const
{
    DirectValue direct(m_var);
    const VARIANT& var = direct.Get();
    switch (var.vt)
    {
    case VT_EMPTY:
        dValue = 0.0;
        return KVT_VARIANT_OK;
    case VT_R8:
        dValue = var.dblVal;
        return KVT_VARIANT_OK;
    case VT_BSTR:
    {
        int nErrorPos;
        return FromConvert(KvtParseDouble(var.bstrVal, int(::SysStringLen(var.bstrVal)), dValue, nErrorPos));
    }
    default:
    {
        int64_t integer;
        bool bTooBig;
        if (ReadInteger(var, integer, bTooBig))
        {
            dValue = bTooBig ? double(var.ullVal) : double(integer);
            return KVT_VARIANT_OK;
        }
        VARIANT result;
        ::VariantInit(&result);
        HRESULT hr = ::VariantChangeType(&result, const_cast<VARIANT*>(&var), VARIANT_NOVALUEPROP, VT_R8);
        if (SUCCEEDED(hr))
            dValue = result.dblVal;
        ::VariantClear(&result);
        return FromHResult(hr);
    }
    }
}

KVTEnumVariantError KVXVariant::GetAs(KVXString& strValue) const
{
    DirectValue direct(m_var);
    const VARIANT& var = direct.Get();
    wchar_t text[KVT_NUMBER_TEXT_MAX];
    if (var.vt == VT_EMPTY)
    {
        strValue.Empty();
        return KVT_VARIANT_OK;
    }
    if (var.vt == VT_BSTR)
    {
        strValue = BstrText(var.bstrVal);
        return KVT_VARIANT_OK;
    }
    int64_t integer;
    bool bTooBig;
    if (ReadInteger(var, integer, bTooBig))
    {
        char digits[KVT_NUMBER_TEXT_MAX];
        std::to_chars_result result = bTooBig
            ? std::to_chars(digits, digits + sizeof(digits) - 1, var.ullVal)
            : std::to_chars(digits, digits + sizeof(digits) - 1, integer);
        *result.ptr = 0;
        strValue = digits;
        return KVT_VARIANT_OK;
    }
    if (var.vt == VT_R8)
    {
        KvtFormatDouble(var.dblVal, text, KVT_NUMBER_TEXT_MAX);
        strValue = text;
        return KVT_VARIANT_OK;
    }
    if (var.vt == VT_R4)
    {
        strValue = ShortestFloatText(var.fltVal);
        return KVT_VARIANT_OK;
    }
    VARIANT result;
    ::VariantInit(&result);
    HRESULT hr = ::VariantChangeType(&result, const_cast<VARIANT*>(&var), VARIANT_NOVALUEPROP, VT_BSTR);
    if (SUCCEEDED(hr))
        strValue = BstrText(result.bstrVal);
    ::VariantClear(&result);
    return FromHResult(hr);
}
