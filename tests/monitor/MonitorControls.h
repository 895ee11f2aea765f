#pragma once

#include "forms/Form.h"
#include "monitor/TableControls.h"

namespace quendra::monitor {

/// The controls of the process table on a form of their own, with the default image that the page puts first.
struct MonitorControls : forms::Form {
  MonitorControls() : Form(u"frmTest") {
    main_ImList.Add(forms::Picture::Artwork("default"));
    table.main_Pic.ScaleMode = forms::ScaleMode::Pixels;
  }
  void Design() override {}

  forms::Frame frameMain{*this, u"frameMain"};
  TableControls table{frameMain};
  forms::ListView& main_ListView1 = table.main_ListView1;
  forms::ImageList& main_ImList = table.main_ImList;
};

/// A row as a pass leaves it, for tests of what happens to rows.
inline forms::ListRow& AddBareRow(forms::ListView& list, const Text& key, const Text& ports = {}) {
  forms::ListRow& row = list.Add(key, u"", 1);
  row.AddCell(u"name", u"");
  row.AddCell(u"", 0);
  row.AddCell(ports, 0);
  for (int cell = 4; cell <= 7; ++cell) row.AddCell(u"0", 0);
  for (int cell = 8; cell <= 9; ++cell) row.AddCell(u"", 0);
  return row;
}

} // namespace quendra::monitor
