#pragma once

#include "forms/FormHost.h"
#include "forms/controls/ListView.h"

namespace quendra::diagnostics {

/// What a check ends with; the number is the icon of the list's images that shows it.
enum class Outcome : int { Passed = 1, Failed = 2 };

/// The list of the surf checks, one row a check: an empty item, then the details, the caption and, once the
/// check has ended, an icon. Knows the row that was added last.
class CheckRows {
 public:
  CheckRows(forms::ListView& surf_ListView1, forms::FormHost& screen)
      : list_(surf_ListView1), screen_(screen) {}

  void Clear();
  /// A row with its caption bold, which becomes the current one.
  void Add(const char16_t* caption, const char16_t* captionKey);
  void AddBlank();
  /// The caption of the current row is bold no more. Nothing where there is no current row.
  void EndBold();
  /// No row is the current one; its details stay within reach.
  void LeaveRow();

  void SetDetail(Text text);
  /// One more bar of a progress that is shown in the details.
  void AppendBar();
  /// The details of the current row, in red.
  void ShowError(Text text);
  void AddIcon(Outcome outcome);

  /// Shows at once what has changed, though the thread is held.
  void Repaint();

 private:
  forms::ListView& list_;
  forms::FormHost& screen_;
  forms::ListRow* surfRowItem_ = nullptr;
  /// The row whose caption and the row whose details are the current ones.
  forms::ListRow* surfCheckCell_ = nullptr;
  forms::ListRow* surfDetailCell_ = nullptr;
};

} // namespace quendra::diagnostics
