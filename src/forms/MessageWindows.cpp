#include "forms/MessageWindows.h"

namespace quendra::forms {

WindowHandle MessageWindows::Create() {
  using Procedure = WindowProcedure::element_type;
  return Add(std::make_shared<Procedure>([](auto...) { return 0; }));
}

} // namespace quendra::forms
