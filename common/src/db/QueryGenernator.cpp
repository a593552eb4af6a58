#include "QueryGenernator.h"

#include <sstream>

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

template <typename T>
std::string NumberText(T value)
{
    std::ostringstream stream;
    stream.precision(15);
    stream << value;
    return stream.str();
}
}  // namespace

QueryGenernator::QueryGenernator() : mConjunction(0)
{
}

QueryGenernator::~QueryGenernator()
{
}

std::string QueryGenernator::MakeSelectQuery(const std::string& table, const std::string& columns,
                                             const std::string& clause1, const std::string& clause2,
                                             const std::string& clause3, const std::string& clause4) const
{
    std::string query = "SELECT" + BLANK + columns + " FROM " + table;
    AppendClause(query, clause1);
    AppendClause(query, clause2);
    AppendClause(query, clause3);
    AppendClause(query, clause4);
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

std::string QueryGenernator::MakeInsertOrReplaceQuery(const std::string& table, const std::string& columns,
                                                      const std::string& placeholders) const
{
    return "INSERT OR REPLACE INTO" + BLANK + table + " (" + columns + ") " + "VALUES" + " ( " + placeholders + ")";
}

std::string QueryGenernator::MakeDeleteQuery(const std::string& table, const std::string& clause) const
{
    std::string query = "DELETE FROM" + BLANK + table;
    AppendClause(query, clause);
    return query;
}

std::string QueryGenernator::MakeOrderByClause(const std::string& column, bool isAscending) const
{
    return "ORDER BY" + BLANK + column + BLANK + (isAscending ? "ASC" : "DESC");
}

std::string QueryGenernator::MakeGroupByClause(const std::string& column) const
{
    return "GROUP BY" + BLANK + column;
}

std::string QueryGenernator::MakeLimitClause(int count) const
{
    return MakeLimitClause(std::to_string(count));
}

std::string QueryGenernator::MakeLimitClause(const std::string& count) const
{
    return "LIMIT" + BLANK + count;
}

std::string QueryGenernator::MakeJoinSelectQuery(const std::string& columns, const std::string& leftSelect,
                                                 const std::string& rightSelect, const std::string& leftKey,
                                                 const std::string& rightKey, const std::string& clause) const
{
    std::string query = "SELECT" + BLANK + columns + " FROM (" + leftSelect + ")" + " leftTable " +
                        "LEFT OUTER JOIN" + " (" + rightSelect + ") rightTable" + " ON leftTable." + leftKey + "=" +
                        "rightTable." + rightKey;
    AppendClause(query, clause);
    return query;
}

std::string QueryGenernator::MakeFunctionText(const std::string& functionName, const std::string& argument) const
{
    return functionName + "(" + argument + ")";
}

void QueryGenernator::ResetCondition(int conjunction)
{
    mCondition.clear();
    mConjunction = conjunction;
}

std::string QueryGenernator::AddCondition(const std::string& condition)
{
    if (mCondition.empty())
        mCondition = condition;
    else
        mCondition += BLANK + (mConjunction == 1 ? "and" : "or") + BLANK + condition;
    return mCondition;
}

std::string QueryGenernator::AddCondition(const std::string& column, int value)
{
    return AddQuotedCondition(column, std::to_string(value));
}

std::string QueryGenernator::AddCondition(const std::string& column, int64_t value)
{
    return AddQuotedCondition(column, std::to_string(value));
}

std::string QueryGenernator::AddCondition(const std::string& column, double value)
{
    return AddQuotedCondition(column, NumberText(value));
}

std::string QueryGenernator::AddCondition(const std::string& column, float value)
{
    return AddQuotedCondition(column, NumberText(value));
}

std::string QueryGenernator::AddCondition(const std::string& column, const std::string& value)
{
    return AddQuotedCondition(column, value);
}

std::string QueryGenernator::AddCondition(const std::string& column, const char* value)
{
    return AddQuotedCondition(column, value ? std::string(value) : std::string());
}

std::string QueryGenernator::EscapeQuotes(const std::string& value)
{
    std::string escaped;
    escaped.reserve(value.size());
    for (char c : value)
    {
        escaped += c;
        if (c == '\'')
            escaped += '\'';
    }
    return escaped;
}

std::string QueryGenernator::AddQuotedCondition(const std::string& column, const std::string& value)
{
    return AddCondition(column + "'" + EscapeQuotes(value) + "'");
}

}  // namespace NSWeather
