#include "platform/windows/adapters/ScriptedManagement.h"

namespace quendra::platform::windows {

namespace {

constexpr TextView kCardClass = u"Win32_NetworkAdapterConfiguration";

std::string Narrow(const wchar_t* text) { return ToCodePage(winapi::TextOf(text)); }

/// The elements of a list, each behind a blank. A list of another kind than methods take is told so.
std::string ElementsOf(const VARIANT& value) {
  if (!(value.vt & VT_ARRAY) || value.parray->cDims != 1) return " (no list)";
  std::string told;
  for (ULONG i = 0; i < value.parray->rgsabound[0].cElements; ++i) {
    if (value.vt == (VT_ARRAY | VT_BSTR))
      told += " " + Narrow(static_cast<BSTR*>(value.parray->pvData)[i]);
    else if (value.vt == (VT_ARRAY | VT_I4))
      told += " " + std::to_string(static_cast<LONG*>(value.parray->pvData)[i]);
    else
      told += " ?";
  }
  return told;
}

} // namespace

HRESULT ScriptedObject::Get(LPCWSTR name, LONG, VARIANT* value, CIMTYPE*, LONG*) {
  if (const auto text = texts.find(winapi::TextOf(name)); text != texts.end()) {
    value->vt = VT_BSTR;
    value->bstrVal = com_.AllocString(winapi::Wide(text->second), static_cast<UINT>(text->second.size()));
    return S_OK;
  }
  const auto number = numbers.find(winapi::TextOf(name));
  if (number == numbers.end()) return static_cast<HRESULT>(WBEM_E_NOT_FOUND);
  value->vt = VT_I4;
  value->lVal = static_cast<LONG>(number->second);
  return S_OK;
}

HRESULT ScriptedObject::Put(LPCWSTR name, LONG, VARIANT* value, CIMTYPE) {
  put += (put.empty() ? "" : ", ") + Narrow(name) + ElementsOf(*value);
  return S_OK;
}

HRESULT ScriptedObject::SpawnInstance(LONG, IWbemClassObject** made) {
  *made = new ScriptedObject(machine_, com_);
  return S_OK;
}

HRESULT ScriptedObject::GetMethod(LPCWSTR, LONG, IWbemClassObject** in, IWbemClassObject**) {
  *in = new ScriptedObject(machine_, com_);
  return S_OK;
}

HRESULT ScriptedAnswer::Next(LONG, ULONG, IWbemClassObject** object, ULONG* count) {
  *count = 0;
  if (next_ == machine_.cards.size()) return WBEM_S_FALSE;
  const ScriptedMachine::Card& card = machine_.cards[next_++];
  auto* const made = new ScriptedObject(machine_, com_);
  made->numbers[u"Index"] = card.index;
  made->texts[u"Description"] = card.description;
  made->texts[u"__PATH"] = u"card " + FromCodePage(std::to_string(card.index));
  *object = made;
  *count = 1;
  return WBEM_S_NO_ERROR;
}

HRESULT ScriptedServices::GetObject(const BSTR path, LONG, IWbemContext*, IWbemClassObject** object,
                                    IWbemCallResult**) {
  if (winapi::TextOf(path) != kCardClass) return static_cast<HRESULT>(WBEM_E_NOT_FOUND);
  *object = new ScriptedObject(machine_, com_);
  return S_OK;
}

HRESULT ScriptedServices::ExecQuery(const BSTR language, const BSTR query, LONG, IWbemContext*,
                                    IEnumWbemClassObject** answer) {
  machine_.queries.push_back(Narrow(language) + ": " + Narrow(query));
  if (FAILED(machine_.query)) return machine_.query;
  *answer = new ScriptedAnswer(machine_, com_);
  return S_OK;
}

HRESULT ScriptedServices::ExecMethod(const BSTR path, const BSTR method, LONG, IWbemContext*,
                                     IWbemClassObject* in, IWbemClassObject** out, IWbemCallResult**) {
  machine_.calls.push_back(Narrow(method) + " of " + Narrow(path) + ": " +
                           static_cast<ScriptedObject*>(in)->put);
  if (FAILED(machine_.method)) return machine_.method;
  auto* const results = new ScriptedObject(machine_, com_);
  results->numbers[u"ReturnValue"] = machine_.result;
  *out = results;
  return S_OK;
}

} // namespace quendra::platform::windows
