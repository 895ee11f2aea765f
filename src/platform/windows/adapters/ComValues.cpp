#include "platform/windows/adapters/ComValues.h"

#include "runtime/Fault.h"

namespace quendra::platform::windows {

namespace {

template <typename Result> Result Made(Result made) {
  if (!made) throw Fault(Fault::kOutOfMemory);
  return made;
}

} // namespace

ComText::ComText(const ComRuntime& com, TextView text)
    : com_(com), text_(Made(com.AllocString(reinterpret_cast<const OLECHAR*>(text.data()),
                                            static_cast<UINT>(text.size())))) {}

ComText::~ComText() { com_.FreeString(text_); }

ComValue::ComValue(const ComRuntime& com, const std::vector<std::string>& texts) : com_(com) {
  BecomeList(VT_BSTR, texts.size());
  for (std::size_t i = 0; i < texts.size(); ++i) {
    const ComText text(com, FromCodePage(texts[i]));
    PutElement(i, text.Get());
  }
}

ComValue::ComValue(const ComRuntime& com, const std::vector<std::uint16_t>& numbers) : com_(com) {
  BecomeList(VT_I4, numbers.size());
  for (std::size_t i = 0; i < numbers.size(); ++i) {
    LONG number = numbers[i];
    PutElement(i, &number);
  }
}

ComValue::~ComValue() { com_.ClearVariant(&value_); }

void ComValue::BecomeList(VARTYPE kind, std::size_t count) {
  value_.parray = Made(com_.CreateVector(kind, 0, static_cast<ULONG>(count)));
  value_.vt = static_cast<VARTYPE>(VT_ARRAY | kind);
}

// The element is copied.
void ComValue::PutElement(std::size_t index, void* element) {
  auto place = static_cast<LONG>(index);
  if (FAILED(com_.PutElement(value_.parray, &place, element))) throw Fault(Fault::kOutOfMemory);
}

Text ComValue::AsText() const {
  return value_.vt == VT_BSTR && value_.bstrVal ? winapi::TextOf(value_.bstrVal) : Text();
}

std::uint32_t ComValue::AsNumber(std::uint32_t otherwise) const {
  switch (value_.vt) {
  case VT_I4:
  case VT_UI4: return value_.ulVal;
  case VT_I2:
  case VT_UI2: return value_.uiVal;
  default: return otherwise;
  }
}

} // namespace quendra::platform::windows
