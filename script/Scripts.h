#pragma once
// The room's modules together, wired to one another.

#include "forms/Forms.h"
#include "platform/Session.h"
#include "script/ComplexMeasurement.h"
#include "script/Executor.h"
#include "script/PhaseDisplay.h"
#include "script/ResultOutput.h"
#include "script/ScriptEditing.h"
#include "script/ScriptParts.h"
#include "script/ScriptWindow.h"

namespace zel {

struct Scripts {
    Scripts(Forms& forms, const InstrumentLine& line, const PanelRoutines& panel,
            ApplicationFolder& folder, const Session& session)
        : results(forms, panel.files, session),
          display(forms.std, forms.specialMeas, session.events),
          complex(forms, line, results, display),
          executor(forms, line, panel, results, complex, session),
          window(forms, panel.files, folder, session),
          editing(forms.scriptEditor, panel.files, session.boxes) {}

    ResultOutput results;
    PhaseDisplay display;
    ComplexMeasurement complex;
    Executor executor;
    ScriptWindow window;
    ScriptEditing editing;
};

}  // namespace zel
