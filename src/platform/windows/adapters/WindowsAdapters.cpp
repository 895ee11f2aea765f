// First of all, for the systems's headers would rename what comes after them.
#include "platform/windows/adapters/Management.h"

#include "platform/windows/adapters/WindowsAdapters.h"
#include "runtime/Fault.h"

namespace quendra::platform::windows {

namespace {

constexpr std::string_view kScheme = "winmgmts:";

ComPtr<IWbemServices> ConnectTo(const ComRuntime& com, std::string_view place) {
  ComPtr<IWbemServices> services;
  const auto locator = com.Create<IWbemLocator>(__uuidof(WbemLocator));
  if (!locator) return services;
  const ComText name(com, FromCodePage(place));
  // Not longer than two minutes where the service hangs.
  const HRESULT connected =
      locator->ConnectServer(name.Get(), nullptr, nullptr, nullptr, WBEM_FLAG_CONNECT_USE_MAX_WAIT, nullptr,
                             nullptr, services.Receive());
  if (SUCCEEDED(connected) && services) com.LetActAsUser(services.Get());
  return services;
}

} // namespace

std::unique_ptr<ManagementServices> WindowsAdapters::GetObject(const std::string& moniker) {
  if (!moniker.starts_with(kScheme)) throw Fault(Fault::kCannotCreateObject);
  auto com = std::make_shared<const ComRuntime>();
  if (!com->IsThere()) throw Fault(Fault::kCannotCreateObject);
  auto services = ConnectTo(*com, std::string_view(moniker).substr(kScheme.size()));
  if (!services) throw Fault(Fault::kCannotCreateObject);
  return std::make_unique<Management>(std::move(com), std::move(services));
}

} // namespace quendra::platform::windows
