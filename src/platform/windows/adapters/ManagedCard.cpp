#include "platform/windows/adapters/ManagedCard.h"

#include "platform/adapters/AdapterNumbers.h"

namespace quendra::platform::windows {

namespace {

constexpr TextView kClass = u"Win32_NetworkAdapterConfiguration";
constexpr auto kAccessIsDenied = static_cast<HRESULT>(WBEM_E_ACCESS_DENIED);
constexpr auto kNoSuchMethod = static_cast<HRESULT>(WBEM_E_INVALID_METHOD);

/// A method that couldn't be called, in the numbers of those that could.
std::uint32_t ResultOf(HRESULT failure) {
  const bool isDenied = failure == kAccessIsDenied || failure == E_ACCESSDENIED;
  return isDenied ? kCardAccessDenied : kCardUnknownFailure;
}

} // namespace

std::uint32_t ManagedCard::EnableStatic(const std::vector<std::string>& addresses,
                                        const std::vector<std::string>& masks) {
  Argument first{L"IPAddress", {*com_, addresses}};
  Argument second{L"SubnetMask", {*com_, masks}};
  return Run(u"EnableStatic", first, second);
}

std::uint32_t ManagedCard::SetGateways(const std::vector<std::string>& gateways,
                                       const std::vector<std::uint16_t>& metrics) {
  Argument first{L"DefaultIPGateway", {*com_, gateways}};
  Argument second{L"GatewayCostMetric", {*com_, metrics}};
  return Run(u"SetGateways", first, second);
}

std::uint32_t ManagedCard::Run(TextView method, Argument& first, Argument& second) {
  ComPtr<IWbemClassObject> arguments;
  if (const HRESULT made = NewArguments(method, arguments); FAILED(made)) return ResultOf(made);
  for (Argument* argument : {&first, &second})
    if (const HRESULT put = arguments->Put(argument->name, 0, argument->value.Get(), 0); FAILED(put))
      return ResultOf(put);
  return Execute(method, arguments.Get());
}

HRESULT ManagedCard::NewArguments(TextView method, ComPtr<IWbemClassObject>& arguments) {
  const ComText name(*com_, kClass);
  ComPtr<IWbemClassObject> description;
  if (const HRESULT got = services_->GetObject(name.Get(), 0, nullptr, description.Receive(), nullptr);
      FAILED(got))
    return got;
  ComPtr<IWbemClassObject> signature;
  const ComText called(*com_, method);
  if (const HRESULT got = description->GetMethod(called.Get(), 0, signature.Receive(), nullptr); FAILED(got))
    return got;
  // A method without arguments has no signature: not the one that we mean.
  return signature ? signature->SpawnInstance(0, arguments.Receive()) : kNoSuchMethod;
}

std::uint32_t ManagedCard::Execute(TextView method, IWbemClassObject* arguments) {
  const ComText path(*com_, place_.path);
  const ComText called(*com_, method);
  ComPtr<IWbemClassObject> results;
  if (const HRESULT run =
          services_->ExecMethod(path.Get(), called.Get(), 0, nullptr, arguments, results.Receive(), nullptr);
      FAILED(run))
    return ResultOf(run);
  ComValue value(*com_);
  if (results) results->Get(L"ReturnValue", 0, value.Get(), nullptr, nullptr);
  return value.AsNumber(kCardUnknownFailure);
}

} // namespace quendra::platform::windows
