#pragma once
// The room's modules together, wired to one another.

#include "forms/Forms.h"
#include "platform/Services.h"
#include "platform/Session.h"
#include "script/ComplexMeasurement.h"
#include "script/Executor.h"
#include "script/PhaseDisplay.h"
#include "script/ResultOutput.h"
#include "script/ScriptEditing.h"
#include "script/ScriptParts.h"
#include "script/ScriptWindow.h"
#include "trace/Interlock.h"

namespace zel {

struct Scripts {
    Scripts(Forms& forms, const InstrumentLine& line, const PanelRoutines& panel,
            ApplicationFolder& folder, const Interlock& interlock)
        : results(forms, panel.files, interlock.session()),
          display(forms.std, forms.specialMeas, interlock.session().events),
          complex(forms, line, results, display),
          executor(forms, line, panel, results, complex, interlock),
          window(forms, panel.files, folder, interlock.session()),
          editing(forms.scriptEditor, panel.files, interlock.session().boxes) {}

    ResultOutput results;
    PhaseDisplay display;
    ComplexMeasurement complex;
    Executor executor;
    ScriptWindow window;
    ScriptEditing editing;
};

}  // namespace zel
