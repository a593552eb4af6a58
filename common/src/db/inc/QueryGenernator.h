#ifndef NSWEATHER_QUERY_GENERNATOR_H
#define NSWEATHER_QUERY_GENERNATOR_H

#include <cstdint>
#include <string>

namespace NSWeather
{

// Builds SQL texts from table names, column lists and clause texts. Empty
// clauses are left out.
class QueryGenernator
{
public:
    QueryGenernator();
    virtual ~QueryGenernator();

    std::string MakeSelectQuery(const std::string& table, const std::string& columns,
                                const std::string& clause1 = std::string(),
                                const std::string& clause2 = std::string(),
                                const std::string& clause3 = std::string(),
                                const std::string& clause4 = std::string()) const;
    std::string MakeWhereClause(const std::string& condition) const;
    std::string MakeUpdateQuery(const std::string& table, const std::string& assignments,
                                const std::string& clause = std::string()) const;
    std::string MakeInsertQuery(const std::string& table, const std::string& columns,
                                const std::string& placeholders) const;
    std::string MakeInsertOrReplaceQuery(const std::string& table, const std::string& columns,
                                         const std::string& placeholders) const;
    std::string MakeDeleteQuery(const std::string& table, const std::string& clause = std::string()) const;
    std::string MakeOrderByClause(const std::string& column, bool isAscending) const;
    std::string MakeGroupByClause(const std::string& column) const;
    std::string MakeLimitClause(int count) const;
    std::string MakeLimitClause(const std::string& count) const;
    std::string MakeJoinSelectQuery(const std::string& columns, const std::string& leftSelect,
                                    const std::string& rightSelect, const std::string& leftKey,
                                    const std::string& rightKey,
                                    const std::string& clause = std::string()) const;
    std::string MakeFunctionText(const std::string& functionName, const std::string& argument) const;

    // conjunction 1 joins with "and", anything else with "or".
    void ResetCondition(int conjunction);
    std::string GetCondition() const { return mCondition; }
    std::string AddCondition(const std::string& condition);
    // `column` carries its operator ("locationId = "); the value is quoted
    // with its own single quotes doubled.
    std::string AddCondition(const std::string& column, int value);
    std::string AddCondition(const std::string& column, int64_t value);
    std::string AddCondition(const std::string& column, double value);
    std::string AddCondition(const std::string& column, float value);
    std::string AddCondition(const std::string& column, const std::string& value);
    std::string AddCondition(const std::string& column, const char* value);

    std::string GetSubQuery() const { return mSubQuery; }

    static std::string EscapeQuotes(const std::string& value);

private:
    std::string AddQuotedCondition(const std::string& column, const std::string& value);

    int mConjunction;
    std::string mCondition;
    std::string mSubQuery;
};

}  // namespace NSWeather

#endif
