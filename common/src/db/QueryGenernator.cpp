#include "QueryGenernator.h"

namespace NSWeather
{

namespace
{
const std::string BLANK = " ";

void AppendClause(std::string& query, const std::string& clause)
{
    if (!clause.empty())
        query += BLANK + clause;
}

}  // namespace

QueryGenernator::QueryGenernator() = default;

QueryGenernator::~QueryGenernator() = default;

std::string QueryGenernator::MakeSelectQuery(const std::string& table, const std::string& columns,
                                             const std::string& clause1, const std::string& clause2) const
{
    std::string query = "SELECT" + BLANK + columns + " FROM " + table;
    AppendClause(query, clause1);
    AppendClause(query, clause2);
    return query;
}

std::string QueryGenernator::MakeWhereClause(const std::string& condition) const
{
    if (condition.empty())
        return std::string();
    return "WHERE" + BLANK + condition;
}

std::string QueryGenernator::MakeUpdateQuery(const std::string& table, const std::string& assignments,
                                             const std::string& clause) const
{
    std::string query = "UPDATE" + BLANK + table + BLANK + "SET" + BLANK + assignments;
    AppendClause(query, clause);
    return query;
}

std::string QueryGenernator::MakeInsertQuery(const std::string& table, const std::string& columns,
                                             const std::string& placeholders) const
{
    return "INSERT INTO" + BLANK + table + " (" + columns + ") " + "VALUES" + " ( " + placeholders + ")";
}

std::string QueryGenernator::MakeOrderByClause(const std::string& column, bool isAscending) const
{
    return "ORDER BY" + BLANK + column + BLANK + (isAscending ? "ASC" : "DESC");
}

}  // namespace NSWeather
