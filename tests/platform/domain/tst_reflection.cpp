#include <domain/appearancevalues.h>
#include <domain/classinformation.h>
#include <domain/classregistration.h>
#include <domain/labvalue.h>
#include <domain/reflection.h>
#include <domain/samplecontext.h>
#include <domain/standard.h>
#include <domain/tagdefinition.h>
#include <domain/toleranceset.h>
#include <domain/trial.h>

#include <QtTest>

#include <set>

using namespace vexa;

namespace {

// Every object reachable from root: owned parts and referenced objects (and theirs).
std::set<const Reflectable *> reachable(const Reflectable &root)
{
    std::set<const Reflectable *> seen;
    std::function<void(const Reflectable &)> walk = [&](const Reflectable &object) {
        object.visit([&](const Reflectable &part) {
            if (!seen.insert(&part).second)
                return;
            for (const auto &m : part.members()) {
                std::vector<std::shared_ptr<BaseObject>> refs;
                m->collectReferences(part, refs);
                for (const auto &r : refs) {
                    if (!seen.count(r.get()))
                        walk(*r);
                }
            }
        });
    };
    walk(root);
    return seen;
}

} // namespace

class tst_Reflection : public QObject
{
    Q_OBJECT
private Q_SLOTS:
    void deepCopyEveryType_data();
    void deepCopyEveryType();
    void deepCopyCopiesASharedReferenceOnce();
    void classInformation();
    void referencedObjects();
};

void tst_Reflection::deepCopyEveryType_data()
{
    QTest::addColumn<QString>("typeName");
    for (const QString &name : ClassRegistration::instance().typeNames())
        QTest::newRow(qPrintable(name)) << name;
}

void tst_Reflection::deepCopyEveryType()
{
    QFETCH(QString, typeName);
    auto original = ClassRegistration::instance().create(typeName);
    SampleContext context(5);
    Reflection::fillWithSamples(*original, context);

    const auto copy = original->clone();
    QVERIFY(copy);
    QCOMPARE(copy->typeName(), typeName);
    QString difference;
    QVERIFY2(Reflection::equal(*original, *copy, &difference), qPrintable(difference));

    const auto fromOriginal = reachable(*original);
    const auto fromCopy = reachable(*copy);
    for (const Reflectable *object : fromCopy)
        QVERIFY2(!fromOriginal.count(object), qPrintable(QStringLiteral("a %1 is shared").arg(object->typeName())));
    QCOMPARE(fromCopy.size(), fromOriginal.size());

    if (auto base = std::dynamic_pointer_cast<BaseObject>(original)) {
        const auto baseCopy = base->deepCopy();
        QCOMPARE(baseCopy->id(), base->id());
        QVERIFY(Reflection::equal(*base, *baseCopy));
    }
}

void tst_Reflection::deepCopyCopiesASharedReferenceOnce()
{
    auto set = std::make_shared<ToleranceSet>();
    auto standard = std::make_shared<Standard>();
    standard->setToleranceSets({set, set});
    auto trial = std::make_shared<Trial>();
    trial->setStandard(standard);
    trial->setAppearanceValues(std::make_shared<AppearanceValues>());
    trial->appearanceValues()->addColorValues(std::make_shared<LabValue>(50, 1, 2));

    const auto copy = std::static_pointer_cast<Trial>(trial->deepCopy());
    QVERIFY(copy->standard() != standard);
    QCOMPARE(copy->standard()->id(), standard->id());
    QCOMPARE(copy->standard()->toleranceSets().size(), size_t(2));
    QVERIFY(copy->standard()->toleranceSets()[0] == copy->standard()->toleranceSets()[1]);
    QVERIFY(copy->standard()->toleranceSets()[0] != set);

    // Changing the copy leaves the original alone.
    std::static_pointer_cast<LabValue>(copy->appearanceValues()->colorValues()[0])->setL(10);
    copy->appearanceValues()->setName(QStringLiteral("changed"));
    QCOMPARE(std::static_pointer_cast<LabValue>(trial->appearanceValues()->colorValues()[0])->l(), 50.0);
    QVERIFY(trial->appearanceValues()->name().isEmpty());
}

void tst_Reflection::classInformation()
{
    Trial trial;
    trial.setName(QStringLiteral("Bumper"));
    trial.setVersion(4);
    const auto info = trial.classInformationObject();
    QCOMPARE(info->className(), QStringLiteral("Trial"));
    QCOMPARE(info->numberOfComponents(), Trial::staticMembers().size());
    QHash<QString, ClassComponent> byName;
    for (int i = 0; i < info->numberOfComponents(); ++i) {
        ClassComponent c;
        QVERIFY(info->didGetComponentWithIndex(i, c));
        byName.insert(c.name(), c);
    }
    ClassComponent none;
    QVERIFY(!info->didGetComponentWithIndex(info->numberOfComponents(), none));
    QVERIFY(!info->didGetComponentWithIndex(-1, none));

    QCOMPARE(byName.value(QStringLiteral("version")).type(), QStringLiteral("int"));
    QCOMPARE(byName.value(QStringLiteral("version")).value().toInt(), 4);
    QCOMPARE(byName.value(QStringLiteral("standard")).type(), QStringLiteral("reference"));
    QCOMPARE(byName.value(QStringLiteral("standard")).innerType(), QStringLiteral("Standard"));
    QCOMPARE(byName.value(QStringLiteral("appearanceValues")).type(), QStringLiteral("ownedObject"));
    const auto header = byName.value(QStringLiteral("header")).value().value<std::shared_ptr<Reflectable>>();
    QVERIFY(header);
    QCOMPARE(header->typeName(), QStringLiteral("Header"));

    const auto registered = ClassRegistration::instance().classInformation(QStringLiteral("Trial"));
    QVERIFY(registered);
    QCOMPARE(registered->numberOfComponents(), info->numberOfComponents());
    QVERIFY(!ClassRegistration::instance().classInformation(QStringLiteral("Paint")));

    int visited = 0;
    trial.visitMembers([&](const MemberDescriptor &, const QVariant &) { ++visited; });
    QCOMPARE(visited, info->numberOfComponents());
}

void tst_Reflection::referencedObjects()
{
    auto set = std::make_shared<ToleranceSet>();
    auto standard = std::make_shared<Standard>();
    standard->setToleranceSets({set});
    Trial trial;
    trial.setStandard(standard);
    auto definition = std::make_shared<TagDefinition>();
    trial.setTagDefinitions({definition});
    const auto refs = trial.referencedObjects();
    QCOMPARE(refs.size(), size_t(2));
    QVERIFY(std::find(refs.begin(), refs.end(), standard) != refs.end());
    QVERIFY(std::find(refs.begin(), refs.end(), definition) != refs.end());
    QCOMPARE(standard->referencedObjects().size(), size_t(1));
}

QTEST_GUILESS_MAIN(tst_Reflection)
#include "tst_reflection.moc"
