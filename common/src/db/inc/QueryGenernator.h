#ifndef NSWEATHER_QUERY_GENERNATOR_H
#define NSWEATHER_QUERY_GENERNATOR_H

#include <string>

namespace NSWeather
{

// Builds SQL texts from table names, column lists and clause texts. Values
// never go into these texts: they are bound to the statement's "?".
// Empty clauses are left out.
class QueryGenernator
{
public:
    QueryGenernator();
    virtual ~QueryGenernator();

    std::string MakeSelectQuery(const std::string& table, const std::string& columns,
                                const std::string& clause1 = std::string(),
                                const std::string& clause2 = std::string()) const;
    std::string MakeWhereClause(const std::string& condition) const;
    std::string MakeUpdateQuery(const std::string& table, const std::string& assignments,
                                const std::string& clause = std::string()) const;
    std::string MakeInsertQuery(const std::string& table, const std::string& columns,
                                const std::string& placeholders) const;
    std::string MakeOrderByClause(const std::string& column, bool isAscending) const;
};

}  // namespace NSWeather

#endif
