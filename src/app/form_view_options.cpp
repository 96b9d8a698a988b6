#include "app/form_view_options.h"

namespace mirel {

FormViewSettings ReadFormViewSettings(const Settings& settings)
{
    return {.confirmDelete = settings.Flag(Setting::FormViewConfirmDelete),
            .confirmSave = settings.Flag(Setting::FormViewConfirmSave),
            .saveAsThirdAnswer = settings.Flag(Setting::FormViewSaveAnswer),
            .updateAggregate = settings.Flag(Setting::FormViewUpdateAggregate),
            .scrollPixels = settings.Int(Setting::FormViewScroll),
            .maxColumnChars = settings.Int(Setting::FormViewMaxColumnChars),
            .holdTimeMs = settings.Int(Setting::FormViewHoldingTime),
            .sortByHeader = settings.Flag(Setting::FormViewSortColumn),
            .fitToWindow = settings.Flag(Setting::FormViewFitToWindow),
            .words = settings.Words()};
}

void WriteFormViewSettings(Settings& settings, const FormViewSettings& options)
{
    settings.SetInt(Setting::FormViewConfirmDelete, options.confirmDelete ? 1 : 0);
    settings.SetInt(Setting::FormViewConfirmSave, options.confirmSave ? 1 : 0);
    settings.SetInt(Setting::FormViewSaveAnswer, options.saveAsThirdAnswer ? 1 : 0);
    settings.SetInt(Setting::FormViewUpdateAggregate, options.updateAggregate ? 1 : 0);
    settings.SetInt(Setting::FormViewScroll, options.scrollPixels);
    settings.SetInt(Setting::FormViewMaxColumnChars, options.maxColumnChars);
    settings.SetInt(Setting::FormViewHoldingTime, options.holdTimeMs);
    settings.SetInt(Setting::FormViewSortColumn, options.sortByHeader ? 1 : 0);
    settings.SetInt(Setting::FormViewFitToWindow, options.fitToWindow ? 1 : 0);
    settings.SetText(Setting::FormViewYesNo, options.words.Setting());
}

} // namespace mirel
