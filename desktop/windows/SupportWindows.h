#pragma once
// The windows that help when something is wrong: about, the report of a failure, the doctor.

#include <QLabel>
#include <QListWidget>
#include <QPlainTextEdit>

#include "desktop/binders/Binder.h"
#include "desktop/windows/FormWindow.h"
#include "forms/SupportForms.h"

namespace zel {

class AboutWindow : public FormWindow {
  public:
    AboutWindow(AboutForm& form, Binder& binder, QWidget* parent);
};

class ErrorWindow : public FormWindow {
  public:
    ErrorWindow(ErrorForm& form, Binder& binder, QWidget* parent);
};

class DoctorWindow : public FormWindow {
  public:
    DoctorWindow(DoctorForm& form, Binder& binder, QWidget* parent);
};

}  // namespace zel
