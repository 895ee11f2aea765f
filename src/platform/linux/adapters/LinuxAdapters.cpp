#include "platform/linux/adapters/LinuxAdapters.h"

#include "platform/linux/adapters/KernelCards.h"
#include "platform/linux/adapters/ManagedCards.h"
#include "runtime/Fault.h"

namespace quendra::platform::linux_ {

namespace {

class Services : public ManagementServices {
 public:
  explicit Services(NetworkManagerBus& bus) : bus_(bus) {}

  NetworkCards ExecQuery(const std::string& query) override {
    if (query != Adapters::kCards) return {};
    auto managed = ReadManagedCards(bus_);
    return managed ? std::move(*managed) : ReadKernelCards();
  }

 private:
  NetworkManagerBus& bus_;
};

} // namespace

std::unique_ptr<ManagementServices> LinuxAdapters::GetObject(const std::string& moniker) {
  if (moniker != kMoniker) throw Fault(Fault::kCannotCreateObject);
  return std::make_unique<Services>(bus_);
}

} // namespace quendra::platform::linux_
