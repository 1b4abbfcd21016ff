#pragma once

#include <QJsonObject>
#include <QString>

#include <vector>

namespace report {

/// A line of the table: what is measured against what, and how far it may go.
struct Figure {
    QString name;
    QString unit;    ///< of both sides: "us", "ms", "MB"
    double ours = 0; ///< in that unit
    double theirs = 0;
    double goal = 0; ///< of ours / theirs, or of ours where theirs is 0
    QString note = {};

    double value() const { return theirs > 0 ? ours / theirs : ours; }
    bool met() const { return value() <= goal; }
};

/// How something grows: a point for each size.
struct Growth {
    QString name;
    QString of;   ///< what the sizes count
    QString unit; ///< of the values
    std::vector<std::pair<int, double>> points;
};

struct Report {
    QString platform; ///< of Qt: "offscreen", "xcb"
    std::vector<Figure> figures;
    std::vector<Growth> growths;

    QString table() const; ///< of Markdown
    QJsonObject json() const;
    /// Figures as bars towards their goals, growths as curves.
    void draw(const QString& svgFile) const;
};

// What is measured, a file each.
void measureDragging(Report& report);
void measureCore(Report& report);
void measureScrolling(Report& report);
void measureBinding(Report& report);
void measurePressing(Report& report);
void measureProcesses(Report& report);
void measureReaders(Report& report);
void measureRows(Report& report);
void measureGrowth(Report& report);

} // namespace report
