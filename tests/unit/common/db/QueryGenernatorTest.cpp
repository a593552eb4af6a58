#include "QueryGenernator.h"

#include <gtest/gtest.h>

#include <string>

#include "TestDB.h"

using NSWeather::QueryGenernator;

TEST(QueryGenernator, SelectLeavesOutEmptyClauses)
{
    QueryGenernator gen;
    EXPECT_EQ(gen.MakeWhereClause(""), "");
    EXPECT_EQ(gen.MakeSelectQuery("CITY_TABLE", "COUNT(*)", gen.MakeWhereClause("")), "SELECT COUNT(*) FROM CITY_TABLE");
    EXPECT_EQ(gen.MakeSelectQuery("CURRENT_WEATHER_TABLE",
                                  "weatherIcon,weatherStatus,curTemperature,lowTemperature,highTemperature,date,"
                                  "websiteUrl",
                                  gen.MakeWhereClause("FK_ID = ?")),
              "SELECT weatherIcon,weatherStatus,curTemperature,lowTemperature,highTemperature,date,websiteUrl FROM "
              "CURRENT_WEATHER_TABLE WHERE FK_ID = ?");
    EXPECT_EQ(gen.MakeSelectQuery("T", "a", "", gen.MakeGroupByClause("b"), gen.MakeOrderByClause("a", false),
                                  gen.MakeLimitClause(3)),
              "SELECT a FROM T GROUP BY b ORDER BY a DESC LIMIT 3");
}

TEST(QueryGenernator, WriteStatementsKeepTheirBlanks)
{
    QueryGenernator gen;
    EXPECT_EQ(gen.MakeInsertQuery("CURRENT_WEATHER_TABLE",
                                  "FK_ID,weatherIcon,weatherStatus,curTemperature,lowTemperature,highTemperature,date,"
                                  "websiteUrl",
                                  "?, ?, ?, ?, ?, ?, ?, ?"),
              "INSERT INTO CURRENT_WEATHER_TABLE (FK_ID,weatherIcon,weatherStatus,curTemperature,lowTemperature,"
              "highTemperature,date,websiteUrl) VALUES ( ?, ?, ?, ?, ?, ?, ?, ?)");
    EXPECT_EQ(gen.MakeInsertOrReplaceQuery("T", "a,b", "?, ?"), "INSERT OR REPLACE INTO T (a,b) VALUES ( ?, ?)");
    EXPECT_EQ(gen.MakeUpdateQuery("T", "a = ?", gen.MakeWhereClause("PK_ID = ?;")),
              "UPDATE T SET a = ? WHERE PK_ID = ?;");
    EXPECT_EQ(gen.MakeUpdateQuery("T", "a = ?", ""), "UPDATE T SET a = ?");
    EXPECT_EQ(gen.MakeDeleteQuery("T", ""), "DELETE FROM T");
    EXPECT_EQ(gen.MakeDeleteQuery("T", gen.MakeWhereClause("x = 1")), "DELETE FROM T WHERE x = 1");
}

TEST(QueryGenernator, ConditionsJoinByConjunction)
{
    QueryGenernator gen;
    EXPECT_EQ(gen.GetCondition(), "");
    gen.AddCondition("a = 1");
    EXPECT_EQ(gen.AddCondition("b = 2"), "a = 1 or b = 2");  // starts joined with "or"
    gen.ResetCondition(1);
    EXPECT_EQ(gen.GetCondition(), "");
    gen.AddCondition("a = 1");
    gen.AddCondition("pageIndex = ", 3);
    gen.AddCondition("refreshedTime = ", static_cast<int64_t>(5000000000LL));
    EXPECT_EQ(gen.GetCondition(), "a = 1 and pageIndex = '3' and refreshedTime = '5000000000'");
    gen.ResetCondition(7);
    gen.AddCondition("x = ", 1.5);
    gen.AddCondition("y = ", 2.25f);
    EXPECT_EQ(gen.GetCondition(), "x = '1.5' or y = '2.25'");
    EXPECT_EQ(gen.GetSubQuery(), "");
}

// A quote inside a value must stay inside the value, not end the literal.
TEST(QueryGenernator, TypedConditionEscapesQuotes)
{
    QueryGenernator gen;
    gen.ResetCondition(1);
    EXPECT_EQ(gen.AddCondition("name = ", std::string("O'Brien")), "name = 'O''Brien'");
    EXPECT_EQ(QueryGenernator::EscapeQuotes("''"), "''''");

    WeatherTest::RawDB db(":memory:");
    db.Exec("CREATE TABLE T (name TEXT); INSERT INTO T VALUES ('O''Brien'), ('other');");
    auto count = [&](const std::string& value) {
        QueryGenernator where;
        where.ResetCondition(1);
        where.AddCondition("name = ", value);
        return db.QueryInt(where.MakeSelectQuery("T", "COUNT(*)", where.MakeWhereClause(where.GetCondition())));
    };
    EXPECT_EQ(count("O'Brien"), 1);
    EXPECT_EQ(count("x' OR '1'='1"), 0);
}
