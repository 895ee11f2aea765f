#pragma once

#include "forms/Form.h"
#include "runtime/OpaqueHandle.h"

namespace quendra::forms {

enum class Modality { Modeless, Modal };

/// The life of forms on a desktop.
class FormHost {
 public:
  virtual ~FormHost() = default;

  /// An empty Tag, Design, then Form_Load. Does nothing for a loaded form. A fault that Form_Load lets escape
  /// leaves the form loaded.
  void Load(Form& form);
  /// Loads where needed and makes visible. Modal returns when the form is hidden or unloaded; `owner` may be
  /// nullptr.
  void Show(Form& form, Modality modality = Modality::Modeless, Form* owner = nullptr);
  /// Form_Unload, then the view goes. Does nothing for a form that isn't loaded or that unloads already. When
  /// the last form has gone the program ends with status 0.
  void Unload(Form& form);
  virtual WindowHandle HandleOf(Form& form) = 0;
  /// Shows the control, or the form, as it is now, for whoever holds the thread. Handles no message.
  virtual void Repaint(Control& control) = 0;

 protected:
  /// A message box or a modal form, counted as standing as long as this lives.
  class Standing {
   public:
    explicit Standing(FormHost& host) : count_(host.standing_) { ++count_; }
    ~Standing() { --count_; }
    Standing(const Standing&) = delete;
    Standing& operator=(const Standing&) = delete;

   private:
    int& count_;
  };
  int StandingCount() const { return standing_; }

  virtual void CreateView(Form& form) = 0;
  virtual void DestroyView(Form& form) = 0;
  virtual void ShowView(Form& form, Modality modality, Form* owner) = 0;
  /// The last loaded form has gone.
  virtual void LastFormGone() = 0;

 private:
  int loadedForms_ = 0;
  int standing_ = 0;
};

} // namespace quendra::forms
