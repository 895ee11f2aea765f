#include "platform/linux/net/NameLookUps.h"

#include "platform/linux/net/NameAnswer.h"

#include <strings.h>

#include <deque>
#include <map>
#include <mutex>
#include <system_error>
#include <thread>

namespace quendra::platform::linux_ {

/// Outlives the object as long as a thread waits for a name server: such a wait can't be cut short.
struct NameLookUps::Shared {
  struct Job {
    LookUpHandle handle;
    std::string name;
  };

  std::mutex lock;
  EventLoop* loop; ///< nullptr once the object has gone
  std::deque<Job> jobs;
  int threads = 0;
  // Only the loop's thread touches these.
  std::map<LookUpHandle, Done> underWay;
  std::uint32_t lastHandle = 0;

  void Finish(const std::shared_ptr<Shared>& self, LookUpHandle handle, NameAnswer answer) {
    const std::scoped_lock guard(lock);
    if (!loop) return;
    loop->Post([self, handle, answer = std::move(answer)] {
      const auto found = self->underWay.find(handle);
      if (found == self->underWay.end()) return;
      const Done done = std::move(found->second);
      self->underWay.erase(found);
      done(answer.error, answer.addresses);
    });
  }
};

NameLookUps::NameLookUps(EventLoop& loop, HostNames& hostNames)
    : hostNames_(hostNames), shared_(std::make_shared<Shared>()) {
  shared_->loop = &loop;
}

NameLookUps::~NameLookUps() {
  shared_->underWay.clear();
  const std::scoped_lock guard(shared_->lock);
  shared_->loop = nullptr;
  shared_->jobs.clear();
}

LookUpHandle NameLookUps::Start(const std::string& name, Done done) {
  const LookUpHandle handle(++shared_->lastHandle);
  shared_->underWay[handle] = std::move(done);
  const auto own = hostNames_.gethostname();
  if (own && ::strcasecmp(own->c_str(), name.c_str()) == 0) {
    const auto addresses = hostNames_.gethostbyname(name);
    shared_->Finish(shared_, handle,
                    addresses ? NameAnswer{0, *addresses} : NameAnswer{hostNames_.LastError(), {}});
    return handle;
  }
  const std::scoped_lock guard(shared_->lock);
  shared_->jobs.push_back({handle, name});
  if (shared_->threads == kMostThreads) return handle;
  try {
    std::thread([shared = shared_] { Work(shared); }).detach();
    ++shared_->threads;
  } catch (const std::system_error&) {
    // The threads that run already will take it up; without any there is no look-up.
    if (shared_->threads > 0) return handle;
    shared_->jobs.clear();
    shared_->underWay.erase(handle);
    return kNoLookUp;
  }
  return handle;
}

bool NameLookUps::Cancel(LookUpHandle lookUp) {
  if (shared_->underWay.erase(lookUp) == 0) return false;
  const std::scoped_lock guard(shared_->lock);
  std::erase_if(shared_->jobs, [&](const Shared::Job& job) { return job.handle == lookUp; });
  return true;
}

void NameLookUps::Work(const std::shared_ptr<Shared>& shared) {
  for (;;) {
    Shared::Job job;
    {
      const std::scoped_lock guard(shared->lock);
      if (shared->jobs.empty()) {
        --shared->threads;
        return;
      }
      job = std::move(shared->jobs.front());
      shared->jobs.pop_front();
    }
    shared->Finish(shared, job.handle, LookUpName(job.name));
  }
}

} // namespace quendra::platform::linux_
