#include "help/help_topics.h"

#include "resources/string_table.h"

#include <algorithm>
#include <array>

namespace mirel {
namespace {

using Row = ControlHelp;

constexpr std::array kTopics = {
    HelpTopic{u"CMainFrame", u"main"},
    HelpTopic{u"CTableView", u"table"},
    HelpTopic{u"CGoToDialog", u"table"},
    HelpTopic{u"CFilterDialog", u"filter"},
    HelpTopic{u"CSortDialog", u"sort"},
    HelpTopic{u"COptionsDialog", u"options"},
    HelpTopic{u"CFormOptionsDialog", u"options"},
    HelpTopic{u"CFontsDialog", u"options"},
    HelpTopic{u"CColorsDialog", u"options"},
    HelpTopic{u"CExportWizard", u"export"},
    HelpTopic{u"CCsvOptionsDialog", u"export"},
    HelpTopic{u"CImportWizard", u"import"},
    HelpTopic{u"CImportOptionsDialog", u"import"},
    HelpTopic{u"CQueryDialog", u"query"},
    HelpTopic{u"CResultWindow", u"query"},
    HelpTopic{u"CStatementDialog", u"query"},
    HelpTopic{u"COpenQueryDialog", u"query"},
    HelpTopic{u"CTableDialog", u"design"},
    HelpTopic{u"CFieldDialog", u"design"},
    HelpTopic{u"CFormEngView", u"form"},
    HelpTopic{u"CFormMakView", u"maker"},
    HelpTopic{u"CFieldsDialog", u"maker"},
    HelpTopic{u"CPropertySheet", u"maker"},
    HelpTopic{u"CExpressionDesk", u"expressions"},
    HelpTopic{u"CFileDialog", u"databases"},
    HelpTopic{u"CInformationDialog", u"databases"},
    HelpTopic{u"CFindingsDialog", u"databases"},
    HelpTopic{u"CDraftsDialog", u"databases"},
    HelpTopic{u"CHelpWindow", u"contents"},
};

constexpr std::array kControls = {
    Row{u"CFilterDialog", Str::FilterFromTo, Str::WhatFilterFromTo},
    Row{u"CFilterDialog", Str::FilterValueName, Str::WhatFilterValue},
    Row{u"CFilterDialog", Str::FilterExpressionLabel, Str::WhatFilterExpression},
    Row{u"CFilterDialog", Str::FilterAndOrNot, Str::WhatFilterAndOrNot},
    Row{u"CSortDialog", Str::SortOrderBy, Str::WhatSortOrderBy},
    Row{u"CSortDialog", Str::SortDirection, Str::WhatSortDirection},
    Row{u"COptionsDialog", Str::OptionConfirmDelete, Str::WhatConfirmDelete},
    Row{u"COptionsDialog", Str::OptionMaximum, Str::WhatMaximumChars},
    Row{u"COptionsDialog", Str::OptionYesNoWords, Str::WhatYesNoWords},
    Row{u"COptionsDialog", Str::OptionHoldPopup, Str::WhatHoldPopup},
    Row{u"COptionsDialog", Str::OptionSortByHeader, Str::WhatSortByHeader},
    Row{u"CFormOptionsDialog", Str::FormOptionConfirmSave, Str::WhatConfirmSave},
    Row{u"CFormOptionsDialog", Str::FormOptionThirdAnswer, Str::WhatThirdAnswer},
    Row{u"CFormOptionsDialog", Str::FormOptionAggregate, Str::WhatAggregates},
    Row{u"CFormOptionsDialog", Str::FormOptionFit, Str::WhatFitForms},
    Row{u"CCsvOptionsDialog", Str::CsvQuote, Str::WhatCsvQuote},
    Row{u"CCsvOptionsDialog", Str::CsvDoubledQuotes, Str::WhatCsvDoubledQuotes},
    Row{u"CCsvOptionsDialog", Str::CsvEncoding, Str::WhatCsvEncoding},
    Row{u"CCsvOptionsDialog", Str::CsvDateFormat, Str::WhatCsvDateFormat},
    Row{u"CImportOptionsDialog", Str::CsvQuote, Str::WhatImportQuote},
    Row{u"CImportOptionsDialog", Str::ImportDecimal, Str::WhatImportDecimal},
    Row{u"CImportOptionsDialog", Str::CsvEncoding, Str::WhatImportEncoding},
    Row{u"CImportOptionsDialog", Str::CsvDateFormat, Str::WhatImportDateFormat},
    Row{u"CFieldDialog", Str::DesignFieldType, Str::WhatFieldType},
    Row{u"CFieldDialog", Str::DesignFieldSize, Str::WhatFieldSize},
    Row{u"CFieldDialog", Str::DesignFieldIndexed, Str::WhatFieldIndexed},
    Row{u"CPropertySheet", Str::PropHasSource, Str::WhatPropHasSource},
    Row{u"CPropertySheet", Str::PropScope, Str::WhatPropScope},
    Row{u"CPropertySheet", Str::PropEditKind, Str::WhatPropEditKind},
    Row{u"CPropertySheet", Str::PropDefaultValue, Str::WhatPropDefaultValue},
    Row{u"CPropertySheet", Str::PropFunction, Str::WhatPropFunction},
    Row{u"CPropertySheet", Str::PropAssignments, Str::WhatPropAssignments},
    Row{u"CPropertySheet", Str::PropItems, Str::WhatPropItems},
    Row{u"CPropertySheet", Str::PropWithResult, Str::WhatPropWithResult},
    Row{u"CQueryDialog", Str::QueryName, Str::WhatQueryName},
    Row{u"CQueryDialog", Str::QueryTables, Str::WhatQueryTables},
    Row{u"CExpressionDesk", Str::DeskText, Str::WhatDeskText},
    Row{u"CColorsDialog", Str::ColorCode, Str::WhatColorCode},
};

QString Plain(QString label)
{
    label = label.remove(u'&').simplified(); // a narrow window breaks it into lines
    while (label.endsWith(u':') || label.endsWith(u'.'))
        label.chop(1);
    return label;
}

} // namespace

std::span<const HelpTopic> HelpTopics()
{
    return kTopics;
}

QString HelpTopicOfClass(QStringView className)
{
    const auto row = std::ranges::find_if(
        kTopics, [className](const HelpTopic& each) { return className == QStringView(each.viewClass); });
    return row == kTopics.end() ? QString() : QStringView(row->topic).toString();
}

std::span<const ControlHelp> ControlHelps()
{
    return kControls;
}

std::optional<Str> HelpOfControl(QStringView className, const QString& label)
{
    const QString plain = Plain(label);
    if (plain.isEmpty())
        return std::nullopt;
    const auto row = std::ranges::find_if(kControls, [&](const ControlHelp& each) {
        return className == QStringView(each.viewClass) && Plain(StringText(each.label)) == plain;
    });
    return row == kControls.end() ? std::nullopt : std::optional(row->text);
}

} // namespace mirel
