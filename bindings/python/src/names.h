#pragma once

// The names that the .sip files have for what is bound: SIP knows classes by one name each, and Qt
// knows the arguments of the widget's signals by these.

#include "references.h"

#include <Zandor/Library.h>
#include <Zandor/QueryDocument.h>
#include <Zandor/Questions.h>
#include <Zandor/ZandorWidget.h>
#include <Zandor/model/Criteria.h>
#include <Zandor/model/Finding.h>
#include <Zandor/model/OutputName.h>
#include <Zandor/sql/Printer.h>

using Path = zandor::files::Path;
using String = zandor::platform::String;

using ZandorModel = ZandorWidget::ZandorModel;
using ZDTable = ZandorWidget::ZDTable;
using ZDColumn = ZandorWidget::ZDColumn;
using ZDJoin = ZandorWidget::ZDJoin;
using ZDColumnDefinition = ZandorWidget::ZDColumnDefinition;
using ZDCriterium = zandor::platform::Ref<TalvikZandorLib::ZDCriterium>;

using zandor::comforts::Flags;
using zandor::files::QueryDocument;
using zandor::model::Column;
using zandor::model::ColumnDefinition;
using zandor::model::ColumnType;
using zandor::model::FieldColumn;
using zandor::model::Format;
using zandor::model::Join;
using zandor::model::Library;
using zandor::model::OutputName;
using zandor::model::Query;
using zandor::model::RowCriterium;
using zandor::model::SavedQuery;
using zandor::model::Table;
using zandor::model::Total;
using zandor::model::sql::Dialect;
using zandor::model::sql::ValueForm;
using FindingKind = zandor::model::Finding::Kind;
