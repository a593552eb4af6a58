#include "theme/ThemeTable.h"

#include <Eina.h>

#include <cerrno>
#include <climits>
#include <cstdlib>
#include <cstring>

#include "core/ApiGuard.h"
#include "dlog.h"

namespace platform
{
namespace theme
{

namespace
{
const char* const LOG_TAG = "platform-theme";

bool ParseInt(const char* text, int& out)
{
    if (!text || !*text)
        return false;
    errno = 0;
    char* end = nullptr;
    long value = strtol(text, &end, 10);
    if (errno != 0 || *end != '\0' || value < INT_MIN || value > INT_MAX)
        return false;
    out = static_cast<int>(value);
    return true;
}

int HexDigit(char c)
{
    if (c >= '0' && c <= '9')
        return c - '0';
    if (c >= 'a' && c <= 'f')
        return c - 'a' + 10;
    if (c >= 'A' && c <= 'F')
        return c - 'A' + 10;
    return -1;
}

// Attributes of one element, as NUL-terminated key/value texts.
typedef std::map<std::string, std::string> Attributes;

Eina_Bool AttributeCb(void* data, const char* key, const char* value)
{
    return NSWeather::ForwardCallback<Attributes>(
        data,
        [key, value](Attributes& attributes)
        {
            attributes.emplace(key, value);
            return EINA_TRUE;
        },
        PLATFORM_CALLBACK_SITE(LOG_TAG), EINA_FALSE);
}

// Splits an element's content into its name and attributes.
std::string ReadElement(const char* content, unsigned length, Attributes& attributes)
{
    const char* attrs = eina_simple_xml_tag_attributes_find(content, length);
    size_t nameLength = attrs ? static_cast<size_t>(attrs - content) : length;
    std::string name(content, nameLength);
    while (!name.empty() && (name.back() == ' ' || name.back() == '\t' || name.back() == '\n' ||
                             name.back() == '\r' || name.back() == '/'))
        name.pop_back();
    if (attrs)
    {
        size_t attrsLength = length - static_cast<size_t>(attrs - content);
        // The self-closing slash is part of the content of an empty tag.
        while (attrsLength > 0 && (attrs[attrsLength - 1] == '/' || attrs[attrsLength - 1] == ' '))
            --attrsLength;
        eina_simple_xml_attributes_parse(attrs, static_cast<unsigned>(attrsLength), AttributeCb, &attributes);
    }
    return name;
}

// Walks the elements of a table document; `onElement` gets each opened
// element below the root, `onClose` each closed one.
class TableWalker
{
public:
    TableWalker(const char* rootName) : mRootName(rootName) {}
    virtual ~TableWalker() = default;

    bool Walk(const std::string& xml)
    {
        Eina_Bool ok = eina_simple_xml_parse(xml.c_str(), static_cast<unsigned>(xml.size()), EINA_TRUE,
                                             &TableWalker::TokenCb, this);
        return ok && mFailure.empty() && mSawRoot;
    }

    const std::string& GetFailure() const { return mFailure; }

protected:
    virtual bool OnElement(const std::string& name, const Attributes& attributes) = 0;
    virtual void OnClose(const std::string& name) { (void)name; }
    void Fail(const std::string& why)
    {
        if (mFailure.empty())
            mFailure = why;
    }

private:
    static Eina_Bool TokenCb(void* data, Eina_Simple_XML_Type type, const char* content, unsigned offset,
                             unsigned length)
    {
        (void)offset;
        return NSWeather::ForwardCallback<TableWalker>(
            data,
            [=](TableWalker& walker)
            { return walker.OnToken(type, content, length) ? EINA_TRUE : EINA_FALSE; },
            PLATFORM_CALLBACK_SITE(LOG_TAG), EINA_FALSE);
    }

    bool OnToken(Eina_Simple_XML_Type type, const char* content, unsigned length)
    {
        switch (type)
        {
            case EINA_SIMPLE_XML_OPEN:
            case EINA_SIMPLE_XML_OPEN_EMPTY:
                return OnOpen(content, length, type == EINA_SIMPLE_XML_OPEN_EMPTY);
            case EINA_SIMPLE_XML_CLOSE:
                OnClose(std::string(content, length));
                return true;
            case EINA_SIMPLE_XML_ERROR:
                Fail("syntax error");
                return false;
            default:
                return true;
        }
    }

    bool OnOpen(const char* content, unsigned length, bool empty)
    {
        Attributes attributes;
        std::string name = ReadElement(content, length, attributes);
        if (!mSawRoot)
        {
            mSawRoot = true;
            if (name != mRootName)
                Fail("root element is not " + mRootName);
            return mFailure.empty() && !empty;
        }
        if (!OnElement(name, attributes))
            return false;
        if (empty)
            OnClose(name);
        return true;
    }

    std::string mRootName;
    std::string mFailure;
    bool mSawRoot = false;
};

class ColorWalker : public TableWalker
{
public:
    explicit ColorWalker(_uxt_theme_color_table& table) : TableWalker("ChangeableColorTable"), mTable(table)
    {
    }

protected:
    bool OnElement(const std::string& name, const Attributes& attributes) override
    {
        if (name == "Theme")
            return OpenTheme(attributes);
        if (name == "Color")
            return AddColor(attributes);
        return true;
    }

    void OnClose(const std::string& name) override
    {
        if (name == "Theme")
            mInTheme = false;
    }

private:
    bool OpenTheme(const Attributes& attributes)
    {
        ThemeSection section;
        auto id = attributes.find("id");
        if (id == attributes.end() || !ParseInt(id->second.c_str(), section.id))
        {
            Fail("Theme without a numeric id");
            return false;
        }
        auto style = attributes.find("style");
        if (style != attributes.end())
            section.style = style->second;
        mTable.sections.push_back(section);
        mInTheme = true;
        return true;
    }

    bool AddColor(const Attributes& attributes)
    {
        auto code = attributes.find("code");
        auto normal = attributes.find("normal");
        if (!mInTheme || code == attributes.end() || code->second.empty() || normal == attributes.end())
        {
            Fail("Color outside a Theme or without code and normal colour");
            return false;
        }
        ThemeColor color;
        bool ok = ParseRgba(normal->second, color.normal) &&
                  ParseOptional(attributes, "outline", color.outline) &&
                  ParseOptional(attributes, "shadow", color.shadow);
        if (ok && attributes.count("pressed"))
            ok = color.hasPressed = ParseRgba(attributes.at("pressed"), color.pressed);
        if (!ok)
        {
            Fail("bad colour of " + code->second);
            return false;
        }
        mTable.sections.back().colors[code->second] = color;
        return true;
    }

    static bool ParseOptional(const Attributes& attributes, const char* key, Rgba& out)
    {
        auto it = attributes.find(key);
        return it == attributes.end() || ParseRgba(it->second, out);
    }

    _uxt_theme_color_table& mTable;
    bool mInTheme = false;
};

class FontWalker : public TableWalker
{
public:
    explicit FontWalker(_uxt_theme_font_table& table) : TableWalker("ChangeableFontTable"), mTable(table) {}

protected:
    bool OnElement(const std::string& name, const Attributes& attributes) override
    {
        if (name != "Font")
            return true;
        auto code = attributes.find("code");
        if (code == attributes.end() || code->second.empty())
        {
            Fail("Font without code");
            return false;
        }
        FontEntry entry;
        if (auto it = attributes.find("name"); it != attributes.end())
            entry.name = it->second;
        if (auto it = attributes.find("size");
            it != attributes.end() && !ParseInt(it->second.c_str(), entry.size))
        {
            Fail("bad size of " + code->second);
            return false;
        }
        mTable.fonts[code->second] = entry;
        return true;
    }

private:
    _uxt_theme_font_table& mTable;
};
}  // namespace

bool ParseRgba(const std::string& text, Rgba& out)
{
    if ((text.size() != 7 && text.size() != 9) || text[0] != '#')
        return false;
    unsigned char channels[4] = {0, 0, 0, 255};
    for (size_t i = 1, c = 0; i < text.size(); i += 2, ++c)
    {
        int high = HexDigit(text[i]);
        int low = HexDigit(text[i + 1]);
        if (high < 0 || low < 0)
            return false;
        channels[c] = static_cast<unsigned char>(high * 16 + low);
    }
    out.r = channels[0];
    out.g = channels[1];
    out.b = channels[2];
    out.a = channels[3];
    return true;
}

int ParseColorTable(const std::string& xml, _uxt_theme_color_table& table)
{
    ColorWalker walker(table);
    bool ok = walker.Walk(xml);
    bool hasColor = false;
    for (const ThemeSection& section : table.sections) hasColor = hasColor || !section.colors.empty();
    if (!ok || !hasColor)
    {
        dlog_print(DLOG_ERROR, LOG_TAG, "colour table rejected: %s",
                   walker.GetFailure().empty() ? "no colour" : walker.GetFailure().c_str());
        return UXT_THEME_ERROR_NO_DATA;
    }
    return UXT_THEME_ERROR_NONE;
}

int ParseFontTable(const std::string& xml, _uxt_theme_font_table& table)
{
    FontWalker walker(table);
    bool ok = walker.Walk(xml);
    if (!ok || table.fonts.empty())
    {
        dlog_print(DLOG_ERROR, LOG_TAG, "font table rejected: %s",
                   walker.GetFailure().empty() ? "no font" : walker.GetFailure().c_str());
        return UXT_THEME_ERROR_NO_DATA;
    }
    return UXT_THEME_ERROR_NONE;
}

}  // namespace theme
}  // namespace platform
