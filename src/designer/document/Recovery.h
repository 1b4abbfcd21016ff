#pragma once

class QWidget;
class QString;

namespace zandor::designer {

class Autosave;
class QueryFile;

/// Offers to go on with the query of a designer that was killed, if there is one in the folder;
/// called once when the window stands. Those after the one taken are offered at the next start.
/// Whether a query was recovered: its database is in the file then.
bool offerRecovery(QueryFile& file, Autosave& autosave, const QString& folder, QWidget* window);

} // namespace zandor::designer
