#ifndef NSWEATHER_TABLE_QUERY_H
#define NSWEATHER_TABLE_QUERY_H

#include <map>
#include <memory>
#include <string>
#include <vector>

#include "CommonLog.h"
#include "DBStatement.h"
#include "Temperature.h"

namespace NSWeather
{

// Statements that the table controllers share, run on the caller's cycle.
// The record tables keep one row per city (keyed by FK_ID); the list tables
// keep one row per entry, with the entry's position as its index column.
// Binders take (statement, first position, record) and return the next
// free position; readers build a record from the current row. Writers
// return false when a step failed (the cycle is then rolled back).
class TableQuery
{
public:
    // The format has one %s for the table name.
    static bool CreateTable(const char* createFormat, const char* tableName);
    static bool DeleteAll(const char* tableName);
    static bool Delete(const char* tableName, int foreignKey);
    // True when the table has a row; false when it is empty or unreadable.
    static bool IsTableExist(const char* tableName);
    // Celsius rounded half up to one decimal; an absent value binds 999.
    static bool BindTemperature(DBStatement& stmt, int index, const TemperaturePtr& temperature);
    static TemperaturePtr ColumnTemperature(const DBStatement& stmt, int column);

    template <typename Record>
    using Binder = int (*)(DBStatement&, int, const std::shared_ptr<Record>&);
    template <typename Record>
    using Reader = std::shared_ptr<Record> (*)(const DBStatement&);
    template <typename Record>
    using ListPtr = std::shared_ptr<std::vector<std::shared_ptr<Record>>>;

    // Insert: FK_ID first, then the values.
    template <typename Record>
    static bool InsertRecord(const std::string& query, int foreignKey, const std::shared_ptr<Record>& record,
                             Binder<Record> bind)
    {
        DBStatement stmt(query);
        stmt.BindInt(1, foreignKey);
        bind(stmt, 2, record);
        return stmt.Execute();
    }

    // Update: the values, then FK_ID for the WHERE clause.
    template <typename Record>
    static bool UpdateRecord(const std::string& query, int foreignKey, const std::shared_ptr<Record>& record,
                             Binder<Record> bind)
    {
        DBStatement stmt(query);
        int i = bind(stmt, 1, record);
        stmt.BindInt(i, foreignKey);
        return stmt.Execute();
    }

    // Null when the city has no row.
    template <typename Record>
    static std::shared_ptr<Record> Select(const std::string& query, int foreignKey, Reader<Record> read)
    {
        DBStatement stmt(query);
        stmt.BindInt(1, foreignKey);
        int rc = stmt.Step();
        if (rc != SQLITE_ROW)
        {
            COMMON_LOG("No result : %d", rc);
            return nullptr;
        }
        return read(stmt);
    }

    // keyColumn holds FK_ID; the first row of a key wins.
    template <typename Record>
    static std::map<int, std::shared_ptr<Record>> SelectAllRecords(const std::string& query, int keyColumn,
                                                                   Reader<Record> read)
    {
        std::map<int, std::shared_ptr<Record>> records;
        DBStatement stmt(query);
        while (stmt.Step() == SQLITE_ROW) records.emplace(stmt.ColumnInt(keyColumn), read(stmt));
        return records;
    }

    // Insert: FK_ID, the index, then the values. Entry i gets index i.
    template <typename Record>
    static bool InsertList(const std::string& query, int foreignKey,
                           const std::vector<std::shared_ptr<Record>>& list, Binder<Record> bind)
    {
        return StepEachEntry(query, list,
                             [&](DBStatement& stmt, int index, const std::shared_ptr<Record>& entry)
                             {
                                 stmt.BindInt(1, foreignKey);
                                 stmt.BindInt(2, index);
                                 bind(stmt, 3, entry);
                             });
    }

    // Update: the values, then FK_ID and the index for the WHERE clause.
    template <typename Record>
    static bool UpdateList(const std::string& query, int foreignKey,
                           const std::vector<std::shared_ptr<Record>>& list, Binder<Record> bind)
    {
        return StepEachEntry(query, list,
                             [&](DBStatement& stmt, int index, const std::shared_ptr<Record>& entry)
                             {
                                 int next = bind(stmt, 1, entry);
                                 stmt.BindInt(next, foreignKey);
                                 stmt.BindInt(next + 1, index);
                             });
    }

    // Never null; empty when the city has no rows.
    template <typename Record>
    static ListPtr<Record> SelectList(const std::string& query, int foreignKey, Reader<Record> read)
    {
        ListPtr<Record> list = std::make_shared<std::vector<std::shared_ptr<Record>>>();
        DBStatement stmt(query);
        stmt.BindInt(1, foreignKey);
        while (stmt.Step() == SQLITE_ROW) list->push_back(read(stmt));
        return list;
    }

    // keyColumn holds FK_ID; each list keeps the order of its rows.
    template <typename Record>
    static std::map<int, ListPtr<Record>> SelectAllLists(const std::string& query, int keyColumn,
                                                         Reader<Record> read)
    {
        std::map<int, ListPtr<Record>> lists;
        DBStatement stmt(query);
        while (stmt.Step() == SQLITE_ROW)
        {
            ListPtr<Record>& list = lists[stmt.ColumnInt(keyColumn)];
            if (!list)
                list = std::make_shared<std::vector<std::shared_ptr<Record>>>();
            list->push_back(read(stmt));
        }
        return lists;
    }

private:
    TableQuery() = delete;

    // One prepared statement serves every entry; null entries are skipped
    // and keep their index free. Stops at the first failed entry.
    template <typename Record, typename BindEntry>
    static bool StepEachEntry(const std::string& query, const std::vector<std::shared_ptr<Record>>& list,
                              BindEntry bindEntry)
    {
        DBStatement stmt(query);
        for (size_t i = 0; i < list.size(); ++i)
        {
            if (!list[i])
                continue;
            stmt.Reset();
            bindEntry(stmt, static_cast<int>(i), list[i]);
            if (stmt.Execute() == false)
                return false;
        }
        return true;
    }
};

}  // namespace NSWeather

#endif
