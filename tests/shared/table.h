#pragma once

#include <QTest>

#include <initializer_list>
#include <tuple>

/** Fills the table of a data-driven test: each row is a name and its values, which row() gives back to the test. */
template<class... Values>
void addRows(std::initializer_list<std::tuple<const char *, Values...>> rows)
{
    QTest::addColumn<std::tuple<Values...>>("row");
    for (const auto &row : rows) {
        std::apply(
            [](const char *name, const Values &...values) { QTest::newRow(name) << std::tuple<Values...>(values...); },
            row);
    }
}

/** The values of the row that is tested. */
template<class... Values>
std::tuple<Values...> row()
{
    using Row = std::tuple<Values...>;
    QFETCH(Row, row);
    return row;
}
