#ifndef TAGS_H
#define TAGS_H

// The tree of tag choices that the customer delivers in "/opt/Filter/":
// a filter is a named category (a make of car), an entry is a choice within
// it, and an entry may hold further filters, so that the first tag narrows
// the choices of the second. The distinct filter names, in walking order,
// are the job's tag states.

#include <QHash>
#include <QString>
#include <QStringList>
#include <QVector>

#include <vector>

// Language code -> name. "default" holds the name as written in the filter
// file.
typedef QHash<QString, QString> TagNameTranslations;

extern const QString kTagDefaultLanguage; // "default"

typedef struct _TAG_ENTRY_DATA_T {
    QString id;
    TagNameTranslations nameHash;
    QString displayName;
    QString filterName; // the filter (tag category) the entry belongs to

    _TAG_ENTRY_DATA_T() { nameHash.insert(QStringLiteral("default"), QString()); }

    QString defaultName() const { return nameHash.value(QStringLiteral("default")); }
    void setDefaultName(const QString& name) { nameHash.insert(QStringLiteral("default"), name); }

    // Same choice: display name, filter, id and "default" name agree.
    bool sameEntry(const _TAG_ENTRY_DATA_T& other) const
    {
        return displayName == other.displayName && filterName == other.filterName
            && id == other.id && defaultName() == other.defaultName();
    }
} TAG_ENTRY_DATA_T;

struct _TAG_ENTRY_T;

typedef struct _TAG_FILTER_T {
    QString name;
    TagNameTranslations filterNameHash;
    std::vector<_TAG_ENTRY_T> entries;
} TAG_FILTER_T;

typedef struct _TAG_ENTRY_T {
    TAG_ENTRY_DATA_T data;
    std::vector<TAG_FILTER_T> filters;
} TAG_ENTRY_T;

typedef std::vector<TAG_FILTER_T> TagsArray;
typedef QVector<TAG_ENTRY_DATA_T> TagEntryList;

typedef struct _TRANSLATION_T {
    QString id;
    TagNameTranslations translations;
} TRANSLATION_T;
typedef QVector<TRANSLATION_T> TranslationList;

// rules: bit 0 narrows the second tag by the first, bit 1 the third by the
// first two. Set when the tree has one top-level filter (both) or two (bit 0).
constexpr unsigned char TAG_RULE_NARROW_SECOND = 0x1;
constexpr unsigned char TAG_RULE_NARROW_THIRD = 0x2;

class Tags
{
public:
    Tags() = default;

    // Parses both files. False (and the old tree kept) when the filter file
    // is refused; a bad translation file only costs the translations.
    bool setTagsArray(const QByteArray& filterBytes, const QByteArray& translationBytes);

    bool hasTags() const { return !tagsArray.empty(); }
    const TagsArray& getTagsArray() const { return tagsArray; }
    int getNumberOfStates() const { return int(m_stateIdentifiers.size()); }
    unsigned char getRules() const { return rules; }

    // The state's filter name in a language, else its plain name; empty for
    // an unknown state.
    QString getFilterName(int state, const QString& language) const;

    TagEntryList getEntryDatasForState(int state) const;
    TagEntryList getSmartEntryDatasForState(int state, const TAG_ENTRY_DATA_T& tag1,
                                            const TAG_ENTRY_DATA_T& tag2) const;
    TAG_ENTRY_DATA_T getParentFilterTag(const TAG_ENTRY_DATA_T& entry) const;

    // Entries whose "default" name begins with text, compared upper-cased.
    TagEntryList autoLookup(const QString& text) const;
    TagEntryList autoLookup(int state, const QString& text) const;
    TagEntryList autoLookupSmart(int state, const QString& text, const TAG_ENTRY_DATA_T& tag1,
                                 const TAG_ENTRY_DATA_T& tag2) const;
    // Their names without duplicates. Only the names are upper-cased here,
    // so text must come in upper case to match.
    QStringList autoLookupStringList(const QString& text) const;
    QStringList autoLookupStringList(int state, const QString& text) const;
    QStringList autoLookupStringList(int state, const QString& text, const TAG_ENTRY_DATA_T& tag1,
                                     const TAG_ENTRY_DATA_T& tag2) const;
    QStringList autoLookupSmartStringList(int state, const QString& text, const TAG_ENTRY_DATA_T& tag1,
                                          const TAG_ENTRY_DATA_T& tag2) const
    {
        return autoLookupStringList(state, text, tag1, tag2);
    }

    bool doesTagNameExist(const QString& name) const;
    bool doesTagNameExist(int state, const QString& name) const;

    // Every filter of the tree, depth first; a name seen before is dropped.
    static TagsArray getAllFilterNames(const TagsArray& tree);
    // Searches the filters below entry for one called name. The result is
    // that of the last branch searched; the tree is meant to hold each
    // filter name once.
    static bool digToFilterFromEntry(const TAG_ENTRY_T& entry, const QString& name, TAG_FILTER_T& filter);

private:
    TagEntryList allEntries() const;

    TagsArray tagsArray;
    TagsArray m_stateIdentifiers;
    unsigned char rules = 0;
};

#endif // TAGS_H
