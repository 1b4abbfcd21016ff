#include "Report.h"

#include <QJsonArray>
#include <QSysInfo>

namespace report {

namespace {

QString number(double value) { return QString::number(value, 'g', 3); }

} // namespace

QString Report::table() const {
    QString text =
        QStringLiteral("| %1 | ours | theirs | value | goal | |\n|---|---|---|---|---|---|\n")
            .arg(platform);
    for (const Figure& figure : figures) {
        const bool alone = figure.theirs <= 0;
        text += QStringLiteral("| %1 | %2 %3 | %4 | %5 | %6 | %7 |\n")
                    .arg(figure.name, number(figure.ours), figure.unit,
                         alone ? QString() : number(figure.theirs) + u' ' + figure.unit,
                         number(figure.value()) + (alone ? u' ' + figure.unit : QString()),
                         number(figure.goal),
                         figure.met() ? QStringLiteral("met") : QStringLiteral("**not met**"));
    }
    return text;
}

QJsonObject Report::json() const {
    QJsonArray all;
    for (const Figure& figure : figures)
        all.append(QJsonObject{{"name", figure.name},
                               {"unit", figure.unit},
                               {"ours", figure.ours},
                               {"theirs", figure.theirs},
                               {"value", figure.value()},
                               {"goal", figure.goal},
                               {"met", figure.met()},
                               {"note", figure.note}});
    QJsonArray curves;
    for (const Growth& growth : growths) {
        QJsonArray points;
        for (const auto& [size, value] : growth.points) points.append(QJsonArray{size, value});
        curves.append(QJsonObject{
            {"name", growth.name}, {"of", growth.of}, {"unit", growth.unit}, {"points", points}});
    }
    return {{"platform", platform},
            {"system", QSysInfo::prettyProductName()},
            {"qt", QString::fromLatin1(qVersion())},
            {"figures", all},
            {"growth", curves}};
}

} // namespace report
