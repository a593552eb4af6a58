#include "SettingsTestSupport.h"

#include <fstream>
#include <iterator>
#include <sstream>

#include <sys/stat.h>

#include "SettingDBController.h"
#include "WeatherDefine.h"

namespace SettingsTest
{

RawDB::RawDB(const std::string& path, bool isReadOnly)
{
    int flags = isReadOnly ? SQLITE_OPEN_READONLY : (SQLITE_OPEN_READWRITE | SQLITE_OPEN_CREATE);
    if (sqlite3_open_v2(path.c_str(), &mHandle, flags, nullptr) != SQLITE_OK)
    {
        sqlite3_close(mHandle);
        mHandle = nullptr;
    }
}

RawDB::~RawDB()
{
    sqlite3_close(mHandle);
}

void RawDB::Exec(const std::string& sql)
{
    char* error = nullptr;
    int rc = sqlite3_exec(mHandle, sql.c_str(), nullptr, nullptr, &error);
    EXPECT_EQ(SQLITE_OK, rc) << sql << ": " << (error ? error : "");
    sqlite3_free(error);
}

bool RawDB::TryExec(const std::string& sql)
{
    return sqlite3_exec(mHandle, sql.c_str(), nullptr, nullptr, nullptr) == SQLITE_OK;
}

std::vector<std::string> RawDB::QueryTexts(const std::string& sql)
{
    std::vector<std::string> texts;
    sqlite3_stmt* stmt = nullptr;
    if (sqlite3_prepare_v2(mHandle, sql.c_str(), -1, &stmt, nullptr) != SQLITE_OK)
    {
        sqlite3_finalize(stmt);
        return texts;
    }
    while (sqlite3_step(stmt) == SQLITE_ROW)
    {
        const unsigned char* text = sqlite3_column_text(stmt, 0);
        texts.push_back(text ? reinterpret_cast<const char*>(text) : "");
    }
    sqlite3_finalize(stmt);
    return texts;
}

std::string RawDB::QueryText(const std::string& sql)
{
    std::vector<std::string> texts = QueryTexts(sql);
    return texts.empty() ? std::string() : texts.front();
}

double RawDB::QueryDouble(const std::string& sql)
{
    std::string text = QueryText(sql);
    return text.empty() ? 0.0 : std::stod(text);
}

long long RawDB::QueryInt(const std::string& sql)
{
    std::string text = QueryText(sql);
    return text.empty() ? 0 : std::stoll(text);
}

std::string RawDB::TableSql(const std::string& table)
{
    return QueryText("SELECT sql FROM sqlite_master WHERE type = 'table' AND name = '" + table + "'");
}

std::vector<std::string> RawDB::ColumnNames(const std::string& table)
{
    return QueryTexts("SELECT name FROM pragma_table_info('" + table + "')");
}

bool FileExists(const std::string& path)
{
    struct stat st;
    return stat(path.c_str(), &st) == 0;
}

std::string ReadFileBytes(const std::string& path)
{
    std::ifstream in(path, std::ios::binary);
    return std::string(std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>());
}

void WriteFileBytes(const std::string& path, const std::string& bytes)
{
    std::ofstream out(path, std::ios::binary | std::ios::trunc);
    out << bytes;
}

SettingsFixture::SettingsFixture()
{
    NSWeather::FileUtil::ClearCache();
}

SettingsFixture::~SettingsFixture()
{
    NSWeather::FileUtil::ClearCache();
}

void SettingsFixture::MakeDBDir() const
{
    mkdir(DBDir().c_str(), 0755);
}

void SettingsFixture::InitializeSettings() const
{
    MakeDBDir();
    ASSERT_EQ(NSWeather::ERR_OK, NSWeather::SettingDBController().Initialize());
}

void SettingsFixture::SetSettingColumn(const std::string& column, const std::string& sqlValue) const
{
    RawDB db(SettingDBPath());
    db.Exec("UPDATE SETTING_TABLE SET " + column + " = " + sqlValue);
}

}  // namespace SettingsTest
