#include <gtest/gtest.h>

#include <set>
#include <string>

#include "forms/Forms.h"

namespace zel {
namespace {

TEST(FormsTest, Forms_AreFoundByTheirNames) {
    Forms forms;
    EXPECT_EQ(forms.form("ControllerForm"), &forms.controller);
    EXPECT_EQ(forms.form("ManualScaleForm"), &forms.manualScale);
    EXPECT_EQ(forms.form("controllerform"), nullptr);
    EXPECT_EQ(forms.form(""), nullptr);
}

TEST(FormsTest, Forms_HaveNamesOfTheirOwn) {
    Forms forms;
    std::set<std::string> names;
    for (const Form* form : forms.all()) EXPECT_TRUE(names.insert(form->name()).second);
    EXPECT_EQ(names.size(), 15U);
}

TEST(FormsTest, BareName_IsAControlOfThePanel) {
    Forms forms;
    EXPECT_EQ(forms.control("CFLabel"), &forms.controller.CFLabel);
    EXPECT_EQ(forms.control("SoftKey(4)"), &forms.controller.SoftKey(4));
    EXPECT_EQ(forms.control("SoftKey(5)"), nullptr);
    EXPECT_EQ(forms.control("COMList"), nullptr);
}

TEST(FormsTest, NameWithItsForm_IsAControlOfThatForm) {
    Forms forms;
    EXPECT_EQ(forms.control("MainForm.COMList"), &forms.main.COMList);
    EXPECT_EQ(forms.control("MainForm.CFLabel"), nullptr);
    EXPECT_EQ(forms.control("NoForm.CFLabel"), nullptr);
    EXPECT_EQ(forms.control(".CFLabel"), nullptr);
}

TEST(FormsTest, Controls_HaveNamesOfTheirOwnInTheirForm) {
    Forms forms;
    for (const Form* form : forms.all()) {
        std::set<std::string> names;
        for (const Control* control : form->controls())
            EXPECT_TRUE(names.insert(control->name()).second)
                << form->name() << "." << control->name();
    }
}

}  // namespace
}  // namespace zel
