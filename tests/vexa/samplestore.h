#pragma once

// The sample data set in a temporary store file, read back object by object; every
// reference is filled in from the store, as the loader of an application does it.

#include <domain/baseobject.h>
#include <domain/recipetrial.h>
#include <domain/standard.h>
#include <domain/toleranceset.h>
#include <domain/trial.h>
#include <sampledata/sampledata.h>
#include <store/objectcodec.h>
#include <store/sqliteobjectstore.h>
#include <store/storerecord.h>

#include <QHash>
#include <QTemporaryDir>

#include <memory>
#include <set>
#include <vector>

namespace samplestore {

struct SampleStore
{
    QTemporaryDir dir;
    QHash<QString, std::shared_ptr<vexa::BaseObject>> objects; // by id
    std::vector<std::shared_ptr<vexa::BaseObject>> inOrder;    // as stored
    QString error;

    SampleStore()
    {
        vexa::SqliteObjectStore store(dir.filePath(QStringLiteral("sample.vexastore")));
        vexa::ErrorInfo info;
        if (!store.open(&info) || !vexa::SampleData::populate(store, &info)) {
            error = info.toString();
            return;
        }
        QHash<QString, vexa::StoreRecord> records;
        store.visitAll(
            [&](const vexa::StoreRecord &record) {
                vexa::ErrorInfo decodeError;
                if (auto object = vexa::ObjectCodec::fromRecord(record, &decodeError)) {
                    objects.insert(object->id(), object);
                    inOrder.push_back(object);
                    records.insert(record.id, record);
                }
                return true;
            },
            &info);
        // Fill the references (stubs) in place, breadth first.
        std::vector<std::shared_ptr<vexa::BaseObject>> pending = inOrder;
        std::set<const vexa::BaseObject *> done;
        while (!pending.empty()) {
            const auto object = pending.back();
            pending.pop_back();
            if (!object || !done.insert(object.get()).second)
                continue;
            for (const auto &reference : object->referencedObjects()) {
                if (reference && reference->isStub() && records.contains(reference->id())) {
                    vexa::ErrorInfo readError;
                    vexa::ObjectCodec::readInto(records.value(reference->id()), reference.get(), &readError);
                }
                pending.push_back(reference);
            }
        }
    }

    template<class T>
    std::vector<std::shared_ptr<T>> all() const
    {
        std::vector<std::shared_ptr<T>> list;
        for (const auto &object : inOrder)
            if (auto typed = std::dynamic_pointer_cast<T>(object))
                list.push_back(typed);
        return list;
    }

    std::shared_ptr<vexa::Standard> standard(const QString &name) const
    {
        for (const auto &standard : all<vexa::Standard>())
            if (standard->name() == name)
                return standard;
        return nullptr;
    }

    // The trials measured against a standard, in stored order.
    std::vector<std::shared_ptr<vexa::Trial>> trialsOf(const std::shared_ptr<vexa::Standard> &standard) const
    {
        std::vector<std::shared_ptr<vexa::Trial>> trials;
        for (const auto &trial : all<vexa::Trial>())
            if (standard && trial->standard() && trial->standard()->id() == standard->id())
                trials.push_back(trial);
        return trials;
    }
};

} // namespace samplestore
