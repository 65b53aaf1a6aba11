#include "SharedSystem/Tags.h"

#include "SharedSystem/XMLParser.h"

#include <QDebug>
#include <QSet>

const QString kTagDefaultLanguage = QStringLiteral("default");

namespace {

void appendEntries(const TAG_FILTER_T& filter, TagEntryList& out)
{
    for (const TAG_ENTRY_T& entry : filter.entries)
        out.append(entry.data);
}

void collectFilters(const TagsArray& filters, TagsArray& out, QSet<QString>& seen)
{
    for (const TAG_FILTER_T& filter : filters) {
        if (!seen.contains(filter.name)) {
            seen.insert(filter.name);
            out.push_back(filter);
        }
        for (const TAG_ENTRY_T& entry : filter.entries)
            collectFilters(entry.filters, out, seen);
    }
}

void collectEntries(const TagsArray& filters, TagEntryList& out)
{
    for (const TAG_FILTER_T& filter : filters) {
        for (const TAG_ENTRY_T& entry : filter.entries) {
            out.append(entry.data);
            collectEntries(entry.filters, out);
        }
    }
}

// The entries of every filter directly below entry.
TagEntryList entriesBelow(const TAG_ENTRY_T& entry)
{
    TagEntryList out;
    for (const TAG_FILTER_T& filter : entry.filters)
        appendEntries(filter, out);
    return out;
}

bool beginsWith(const TAG_ENTRY_DATA_T& entry, const QString& text)
{
    return entry.defaultName().left(text.length()).toUpper() == text.toUpper();
}

TagEntryList lookup(const TagEntryList& entries, const QString& text)
{
    TagEntryList out;
    for (const TAG_ENTRY_DATA_T& entry : entries) {
        if (beginsWith(entry, text))
            out.append(entry);
    }
    return out;
}

QStringList lookupNames(const TagEntryList& entries, const QString& text)
{
    QStringList out;
    for (const TAG_ENTRY_DATA_T& entry : entries) {
        const QString name = entry.defaultName();
        if (name.left(text.length()).toUpper() == text)
            out.append(name);
    }
    out.removeDuplicates();
    return out;
}

} // namespace

bool Tags::setTagsArray(const QByteArray& filterBytes, const QByteArray& translationBytes)
{
    const QString filterSchema = QString::fromLatin1(FILTER_SCHEMA_PATH);
    const QString translationSchema = QString::fromLatin1(TRANSLATION_SCHEMA_PATH);

    TranslationList translations;
    {
        XMLParser parser(filterSchema, translationSchema);
        if (parser.parseTagLanguageXML(translationBytes, translations) != 0) {
            qDebug().noquote() << "No translation file being used.  Either empty or invalid formatting";
            translations.clear();
        }
    }

    TagsArray tree;
    XMLParser parser(filterSchema, translationSchema);
    if (parser.parseTagXML(filterBytes, tree, translations) != 0)
        return false;

    tagsArray = tree;
    if (tagsArray.size() == 1)
        rules |= TAG_RULE_NARROW_SECOND | TAG_RULE_NARROW_THIRD;
    else if (tagsArray.size() == 2)
        rules |= TAG_RULE_NARROW_SECOND;
    m_stateIdentifiers = getAllFilterNames(tagsArray);
    return true;
}

TagsArray Tags::getAllFilterNames(const TagsArray& tree)
{
    TagsArray out;
    QSet<QString> seen;
    collectFilters(tree, out, seen);
    return out;
}

bool Tags::digToFilterFromEntry(const TAG_ENTRY_T& entry, const QString& name, TAG_FILTER_T& filter)
{
    bool result = false;
    for (const TAG_FILTER_T& below : entry.filters) {
        if (below.name == name) {
            filter = below;
            return true;
        }
        for (const TAG_ENTRY_T& next : below.entries)
            result = digToFilterFromEntry(next, name, filter);
    }
    return result;
}

QString Tags::getFilterName(int state, const QString& language) const
{
    if (state < 0 || state >= int(m_stateIdentifiers.size()))
        return QString();
    const TAG_FILTER_T& filter = m_stateIdentifiers.at(size_t(state));
    const QString translated = filter.filterNameHash.value(language);
    return translated.isEmpty() ? filter.name : translated;
}

TagEntryList Tags::getEntryDatasForState(int state) const
{
    TagEntryList out;
    const QString name = getFilterName(state, kTagDefaultLanguage);
    for (const TAG_FILTER_T& top : tagsArray) {
        if (top.name == name) {
            appendEntries(top, out);
            continue;
        }
        for (const TAG_ENTRY_T& entry : top.entries) {
            TAG_FILTER_T found;
            if (digToFilterFromEntry(entry, name, found))
                appendEntries(found, out);
        }
    }
    return out;
}

TagEntryList Tags::getSmartEntryDatasForState(int state, const TAG_ENTRY_DATA_T& tag1,
                                              const TAG_ENTRY_DATA_T& tag2) const
{
    switch (state) {
    case 0:
        return getEntryDatasForState(0);
    case 1:
        if ((rules & TAG_RULE_NARROW_SECOND) && !tagsArray.empty()) {
            for (const TAG_ENTRY_T& entry : tagsArray.front().entries) {
                if (entry.data.defaultName() == tag1.defaultName())
                    return entriesBelow(entry);
            }
        }
        return getEntryDatasForState(1);
    case 2:
        if ((rules & TAG_RULE_NARROW_THIRD) && !tagsArray.empty()) {
            // Only the first entry of the first filter is ever looked at.
            for (const TAG_ENTRY_T& entry : tagsArray.front().entries) {
                if (entry.data.defaultName() == tag1.defaultName()) {
                    for (const TAG_FILTER_T& filter : entry.filters) {
                        for (const TAG_ENTRY_T& second : filter.entries) {
                            if (second.data.defaultName() == tag2.defaultName())
                                return entriesBelow(second);
                        }
                    }
                }
                return getEntryDatasForState(2);
            }
        }
        return getEntryDatasForState(2);
    default:
        return TagEntryList();
    }
}

TAG_ENTRY_DATA_T Tags::getParentFilterTag(const TAG_ENTRY_DATA_T& entry) const
{
    for (int state = 0; state < 3; ++state) {
        const QString name = getFilterName(state, kTagDefaultLanguage);
        for (const TAG_FILTER_T& top : tagsArray) {
            for (const TAG_ENTRY_T& topEntry : top.entries) {
                TAG_FILTER_T found;
                if (!digToFilterFromEntry(topEntry, name, found))
                    continue;
                for (const TAG_ENTRY_T& candidate : found.entries) {
                    if (candidate.data.id == entry.id && candidate.data.defaultName() == entry.defaultName())
                        return topEntry.data;
                }
            }
        }
    }
    return TAG_ENTRY_DATA_T();
}

TagEntryList Tags::allEntries() const
{
    TagEntryList out;
    collectEntries(tagsArray, out);
    return out;
}

TagEntryList Tags::autoLookup(const QString& text) const
{
    return lookup(allEntries(), text);
}

TagEntryList Tags::autoLookup(int state, const QString& text) const
{
    return lookup(getEntryDatasForState(state), text);
}

TagEntryList Tags::autoLookupSmart(int state, const QString& text, const TAG_ENTRY_DATA_T& tag1,
                                   const TAG_ENTRY_DATA_T& tag2) const
{
    return lookup(getSmartEntryDatasForState(state, tag1, tag2), text);
}

QStringList Tags::autoLookupStringList(const QString& text) const
{
    return lookupNames(allEntries(), text);
}

QStringList Tags::autoLookupStringList(int state, const QString& text) const
{
    return lookupNames(getEntryDatasForState(state), text);
}

QStringList Tags::autoLookupStringList(int state, const QString& text, const TAG_ENTRY_DATA_T& tag1,
                                       const TAG_ENTRY_DATA_T& tag2) const
{
    return lookupNames(getSmartEntryDatasForState(state, tag1, tag2), text);
}

bool Tags::doesTagNameExist(const QString& name) const
{
    const QString wanted = name.trimmed();
    for (const TAG_ENTRY_DATA_T& entry : allEntries()) {
        if (entry.defaultName().trimmed() == wanted)
            return true;
    }
    for (const TAG_FILTER_T& filter : m_stateIdentifiers) {
        if (filter.name.trimmed() == wanted)
            return true;
    }
    return false;
}

bool Tags::doesTagNameExist(int state, const QString& name) const
{
    const QString wanted = name.trimmed();
    for (const TAG_ENTRY_DATA_T& entry : getEntryDatasForState(state)) {
        if (entry.defaultName().trimmed() == wanted)
            return true;
    }
    return false;
}
