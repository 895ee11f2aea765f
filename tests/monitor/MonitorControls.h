#pragma once

#include "forms/Form.h"
#include "monitor/MonitorPage.h"

namespace quendra::monitor {

/// The controls of the monitor page on a form of their own, with the default image that the main window puts
/// first.
struct MonitorControls : forms::Form {
  MonitorControls() : Form(u"frmTest") {
    main_ImList.Add(forms::Picture::Artwork("default"));
    main_Pic.ScaleMode = 3;
  }
  void Design() override {}

  MonitorPage Page() {
    return {frameMain,      main_ListView1,   main_ImList,      main_headersIL,      main_Pic,
            main_lblUpload, main_lblDownload, main_cmbAdapters, main_lblCaptureState};
  }

  forms::Frame frameMain{*this, u"frameMain"};
  forms::ListView main_ListView1{frameMain, u"main_ListView1"};
  forms::ImageList main_ImList{frameMain, u"main_ImList"};
  forms::ImageList main_headersIL{frameMain, u"main_headersIL"};
  forms::PictureBox main_Pic{frameMain, u"main_Pic"};
  forms::Label main_lblUpload{frameMain, u"main_lblUpload"};
  forms::Label main_lblDownload{frameMain, u"main_lblDownload"};
  forms::ComboBox main_cmbAdapters{frameMain, u"main_cmbAdapters"};
  forms::Label main_lblCaptureState{frameMain, u"main_lblCaptureState"};
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
