#pragma once

#include "diagnostics/CheckRows.h"
#include "diagnostics/mdlInternetCache.h"
#include "foundation/RegEdit.h"
#include "platform/internet/UrlCache.h"

namespace quendra::diagnostics {

/// Empties the system's internet cache, save what holds cookies, and limits its size. Always a pass.
class CacheCheck {
 public:
  CacheCheck(platform::UrlCache& cache, mdlInternetCache& list, foundation::RegEdit& registry)
      : cache_(cache), list_(list), registry_(registry) {}

  Outcome Run(CheckRows& rows);

 private:
  void DeleteEntries(CheckRows& rows);
  void LimitSize();

  platform::UrlCache& cache_;
  mdlInternetCache& list_;
  foundation::RegEdit& registry_;
};

} // namespace quendra::diagnostics
