#include "browserfixtures.h"

#include <vexa/browser/abstracttreeitem.h>
#include <vexa/browser/abstracttreeitemmodel.h>
#include <vexa/browser/baseobjecttreemodel.h>

#include <domain/domainmetatypes.h>
#include <domain/folder.h>
#include <domain/toleranceset.h>
#include <utilities/logger.h>

#include <QAbstractItemModelTester>
#include <QMimeData>
#include <QSignalSpy>
#include <QtTest>

using namespace vexa;
using Node = BaseObjectTreeModel::Node;

namespace {

std::shared_ptr<BaseObject> object(const QString &name, const QString &id)
{
    auto set = std::make_shared<ToleranceSet>();
    set->setName(name);
    set->setId(id);
    return set;
}

// Records the order in which its nodes die.
QStringList *deaths = nullptr;

class RecordingNode : public GeneralBranchNode
{
public:
    RecordingNode(Node *parent, const QString &name)
        : GeneralBranchNode(parent, object(name, name))
        , m_name(name)
    {
        setIsDragEnabled(true);
        setIsDropEnabled(true);
    }
    ~RecordingNode() override
    {
        if (deaths)
            *deaths << m_name;
    }

private:
    QString m_name;
};

// A tree of named nodes: "a" (with "a1" (with "a11"), "a2"), "b", "c".
class TreeModel : public BaseObjectTreeModel
{
public:
    using BaseObjectTreeModel::BaseObjectTreeModel;
    std::shared_ptr<Node> newRootNode() override
    {
        auto root = std::make_shared<GeneralBranchNode>(nullptr, nullptr);
        auto *a = new RecordingNode(root.get(), "a");
        auto *a1 = new RecordingNode(a, "a1");
        a1->insertIntoCache(new RecordingNode(a1, "a11"), 0);
        a->insertIntoCache(a1, 0);
        a->insertIntoCache(new RecordingNode(a, "a2"), 1);
        root->insertIntoCache(a, 0);
        root->insertIntoCache(new RecordingNode(root.get(), "b"), 1);
        root->insertIntoCache(new RecordingNode(root.get(), "c"), 2);
        return root;
    }
};

// A model that has no root until initialize().
class EmptyModel : public BaseObjectTreeModel
{
public:
    std::shared_ptr<Node> newRootNode() override { return std::make_shared<GeneralBranchNode>(nullptr, nullptr); }
};

class LabelModel : public AbstractTreeItemModel
{
public:
    std::vector<QString> headerLabels() const override { return {"Name", "Kind"}; }
};

QModelIndex find(const QAbstractItemModel &model, const QString &name, const QModelIndex &parent = QModelIndex())
{
    for (int row = 0; row < model.rowCount(parent); ++row) {
        const QModelIndex index = model.index(row, 0, parent);
        if (index.data(Qt::EditRole).toString() == name)
            return index;
        const QModelIndex below = find(model, name, index);
        if (below.isValid())
            return below;
    }
    return QModelIndex();
}

} // namespace

// The tree framework: the generic item tree and the object tree with its roles, edits,
// removal order, drops and the modified mark.
class tst_BaseObjectTreeModel : public QObject
{
    Q_OBJECT
private Q_SLOTS:
    void initTestCase() { registerDomainMetaTypes(); }
    void itemTreeAnnouncesItsRows();
    void itemTreeHeader_data();
    void itemTreeHeader();
    void emptyModelAnswersNothing();
    void rolesOfANode_data();
    void rolesOfANode();
    void nodeWithoutCargo();
    void setDataRoles_data();
    void setDataRoles();
    void removeRowsDeletesFromTheLastRowWithSignalsBlocked();
    void removeRowsRefusesBadRanges_data();
    void removeRowsRefusesBadRanges();
    void moveRowsChangesNothing();
    void dropMarksOnlyTheTopLevelNode();
    void childNodeWithIdSearchesDepthFirst();
    void itemDataCarriesCargoAndNode();
};

void tst_BaseObjectTreeModel::itemTreeAnnouncesItsRows()
{
    LabelModel model;
    auto tester = std::make_unique<QAbstractItemModelTester>(&model, QAbstractItemModelTester::FailureReportingMode::QtTest);
    QSignalSpy inserted(&model, &QAbstractItemModel::rowsInserted);
    auto first = model.addRootItem(std::make_shared<DefaultTreeItem>("first", nullptr));
    auto child = model.addItem(std::make_shared<DefaultTreeItem>("child", nullptr), first.get());
    model.addRootItem(std::make_shared<DefaultTreeItem>("second", nullptr));
    model.addRootItem(std::make_shared<DefaultTreeItem>("third", nullptr));
    QCOMPARE(inserted.count(), 4);
    QCOMPARE(model.rowCount(), 3);
    const QModelIndex childIndex = model.index(0, 0, model.index(0, 0));
    QCOMPARE(childIndex.data().toString(), QStringLiteral("child"));
    QCOMPARE(model.parent(childIndex), model.index(0, 0));
    QCOMPARE(model.index(0, 1, model.index(0, 0)).data().toString(), QString()); // other columns: no text
    QCOMPARE(child->row(), 0);
    QCOMPARE(model.flags(childIndex), Qt::ItemIsSelectable | Qt::ItemIsEnabled);
    QVERIFY(!model.data(childIndex, Qt::ToolTipRole).isValid());

    // clear() announces rows 0 to 3 for three items: one past the last.
    QSignalSpy removing(&model, &QAbstractItemModel::rowsAboutToBeRemoved);
    tester.reset(); // the tester would object to that announcement, as any checker would
    model.clear();
    QCOMPARE(removing.count(), 1);
    QCOMPARE(removing.front().at(1).toInt(), 0);
    QCOMPARE(removing.front().at(2).toInt(), 3);
    QCOMPARE(model.rowCount(), 0);
}

void tst_BaseObjectTreeModel::itemTreeHeader_data()
{
    QTest::addColumn<int>("section");
    QTest::addColumn<int>("role");
    QTest::addColumn<QVariant>("expected");
    QTest::newRow("first label") << 0 << int(Qt::DisplayRole) << QVariant(QStringLiteral("Name"));
    QTest::newRow("beyond the labels") << 2 << int(Qt::DisplayRole) << QVariant();
    QTest::newRow("other role") << 0 << int(Qt::ToolTipRole) << QVariant();
}

void tst_BaseObjectTreeModel::itemTreeHeader()
{
    QFETCH(int, section);
    QFETCH(int, role);
    QFETCH(QVariant, expected);
    LabelModel model;
    QCOMPARE(model.columnCount(), 2);
    QCOMPARE(model.headerData(section, Qt::Horizontal, role), expected);
}

void tst_BaseObjectTreeModel::emptyModelAnswersNothing()
{
    EmptyModel model;
    QCOMPARE(model.rowCount(), 0);
    QVERIFY(!model.hasChildren());
    QVERIFY(!model.index(0, 0).isValid());
    for (int role : {Qt::DisplayRole, Qt::DecorationRole, Qt::EditRole, Qt::ToolTipRole, Qt::UserRole})
        QVERIFY(!model.data(QModelIndex(), role).isValid());
    QVERIFY(!model.nodeWithID("x"));
    QVERIFY(model.canFetchMore(QModelIndex()));
    model.initialize();
    QCOMPARE(model.rowCount(), 0);
}

void tst_BaseObjectTreeModel::rolesOfANode_data()
{
    QTest::addColumn<bool>("modified");
    QTest::addColumn<QString>("display");
    QTest::newRow("saved") << false << "b";
    QTest::newRow("modified") << true << "b *";
}

void tst_BaseObjectTreeModel::rolesOfANode()
{
    QFETCH(bool, modified);
    QFETCH(QString, display);
    TreeModel model;
    model.initialize();
    browserfixtures::ModelTester tester(&model);
    const QModelIndex b = find(model, "b");
    model.nodeFromIndex(b)->setIsModified(modified);
    QCOMPARE(b.data(Qt::DisplayRole).toString(), display);
    QCOMPARE(b.data(Qt::EditRole).toString(), QStringLiteral("b"));
    QCOMPARE(b.data(Qt::ToolTipRole).toString(), QStringLiteral("b"));
    QVERIFY(!b.data(Qt::FontRole).isValid());
    QVERIFY(!b.data(Qt::UserRole + 1).isValid());
    QCOMPARE(b.data(Qt::UserRole).value<std::shared_ptr<BaseObject>>()->id(), QStringLiteral("b"));
    QVERIFY(!model.index(b.row(), 1, b.parent()).isValid() || !model.data(model.index(b.row(), 1)).isValid());
    QCOMPARE(model.flags(b), Qt::ItemIsSelectable | Qt::ItemIsEnabled | Qt::ItemIsDragEnabled | Qt::ItemIsDropEnabled);
    model.addButton();
    QCOMPARE(model.columnCount(), 2);
    QVERIFY(!model.data(model.index(b.row(), 1)).isValid()); // only column 0 has data
}

void tst_BaseObjectTreeModel::nodeWithoutCargo()
{
    TreeModel model;
    model.initialize();
    QVERIFY(model.insertRows(0, 1, QModelIndex()));
    const QModelIndex empty = model.index(0, 0);
    QCOMPARE(empty.data().toString(), QString());
    QVERIFY(!empty.data(Qt::UserRole).isValid());
    QVERIFY(empty.data(Qt::DecorationRole).value<QIcon>().isNull());
    QCOMPARE(model.flags(empty), Qt::ItemIsSelectable | Qt::ItemIsEnabled);
}

void tst_BaseObjectTreeModel::setDataRoles_data()
{
    QTest::addColumn<int>("column");
    QTest::addColumn<int>("role");
    QTest::addColumn<bool>("withObject");
    QTest::addColumn<bool>("result");
    QTest::addColumn<int>("changes");
    QTest::newRow("column 1") << 1 << int(Qt::UserRole) << true << true << 0;
    QTest::newRow("display role") << 0 << int(Qt::DisplayRole) << true << true << 0;
    QTest::newRow("null object") << 0 << int(Qt::UserRole) << false << false << 0;
    QTest::newRow("object") << 0 << int(Qt::UserRole) << true << true << 1;
}

void tst_BaseObjectTreeModel::setDataRoles()
{
    QFETCH(int, column);
    QFETCH(int, role);
    QFETCH(bool, withObject);
    QFETCH(bool, result);
    QFETCH(int, changes);
    TreeModel model;
    model.initialize();
    model.addButton();
    const QModelIndex c = find(model, "c");
    QSignalSpy changed(&model, &QAbstractItemModel::dataChanged);
    QSignalSpy nodeChanged(&model, &BaseObjectTreeModel::sgDataHasChanged);
    const auto replacement = withObject ? object("c2", "c2") : std::shared_ptr<BaseObject>();
    QCOMPARE(model.setData(model.index(c.row(), column), QVariant::fromValue(replacement), role), result);
    QCOMPARE(changed.count(), changes);
    QCOMPARE(nodeChanged.count(), changes);
    QCOMPARE(model.index(c.row(), 0).data(Qt::EditRole).toString(), changes ? QStringLiteral("c2") : QStringLiteral("c"));
}

void tst_BaseObjectTreeModel::removeRowsDeletesFromTheLastRowWithSignalsBlocked()
{
    TreeModel model;
    model.initialize();
    browserfixtures::ModelTester tester(&model);
    QStringList died;
    deaths = &died;
    QSignalSpy removed(&model, &QAbstractItemModel::rowsRemoved);
    QSignalSpy rowsChanged(&model, &BaseObjectTreeModel::sgRowsChanged);
    QVERIFY(model.removeRows(1, 2, QModelIndex()));
    deaths = nullptr;
    QCOMPARE(died, (QStringList{"c", "b"}));
    QCOMPARE(removed.count(), 1);
    QCOMPARE(rowsChanged.count(), 1);
    QCOMPARE(model.rowCount(), 1);
    QVERIFY(!model.signalsBlocked());
}

void tst_BaseObjectTreeModel::removeRowsRefusesBadRanges_data()
{
    QTest::addColumn<int>("row");
    QTest::addColumn<int>("count");
    QTest::newRow("nothing") << 0 << 0;
    QTest::newRow("negative row") << -1 << 1;
    QTest::newRow("past the end") << 2 << 2;
}

void tst_BaseObjectTreeModel::removeRowsRefusesBadRanges()
{
    QFETCH(int, row);
    QFETCH(int, count);
    TreeModel model;
    model.initialize();
    QVERIFY(!model.removeRows(row, count, QModelIndex()));
    QCOMPARE(model.rowCount(), 3);
}

void tst_BaseObjectTreeModel::moveRowsChangesNothing()
{
    TreeModel model;
    model.initialize();
    QVERIFY(model.moveRows(QModelIndex(), 0, 1, QModelIndex(), 3));
    QCOMPARE(model.index(0, 0).data().toString(), QStringLiteral("a"));
    QCOMPARE(model.rowCount(), 3);
}

void tst_BaseObjectTreeModel::dropMarksOnlyTheTopLevelNode()
{
    TreeModel model;
    model.initialize();
    browserfixtures::ModelTester tester(&model);
    std::unique_ptr<QMimeData> data(model.mimeData({find(model, "c")}));
    const QModelIndex a11 = find(model, "a11");
    QVERIFY(model.dropMimeData(data.get(), Qt::CopyAction, -1, 0, a11));
    QCOMPARE(model.rowCount(a11), 1);
    QCOMPARE(model.index(0, 0, a11).data(Qt::EditRole).toString(), QStringLiteral("c")); // the cargo came along
    QCOMPARE(find(model, "a").data().toString(), QStringLiteral("a *"));
    for (const char *other : {"a1", "a11", "a2", "b", "c"})
        QVERIFY(!find(model, other).data().toString().endsWith(QLatin1String(" *")));
}

void tst_BaseObjectTreeModel::childNodeWithIdSearchesDepthFirst()
{
    TreeModel model;
    model.initialize();
    // "a11" sits below "a1", which comes before "b": found before "b" is looked at.
    Node *found = model.nodeWithID("a11");
    QVERIFY(found);
    QCOMPARE(found->parent()->objectId(), std::string("a1"));
    QCOMPARE(model.nodeWithParentAndID(model.nodeFromIndex(find(model, "a")), "a2")->objectId(), std::string("a2"));
    QVERIFY(!model.nodeWithID(QString()));
    QVERIFY(!model.nodeWithParentAndID(nullptr, "a"));
    QVERIFY(!model.nodeWithID("zz"));
}

void tst_BaseObjectTreeModel::itemDataCarriesCargoAndNode()
{
    TreeModel model;
    model.initialize();
    const QModelIndex b = find(model, "b");
    const QMap<int, QVariant> roles = model.itemData(b);
    QVERIFY(roles.contains(Qt::UserRole));
    QCOMPARE(roles.value(BaseObjectTreeModel::NodeAddressRole).toULongLong(),
             qulonglong(quintptr(model.nodeFromIndex(b))));
    QCOMPARE(model.supportedDropActions(), Qt::CopyAction | Qt::MoveAction | Qt::LinkAction);
}

QTEST_MAIN(tst_BaseObjectTreeModel)
#include "tst_baseobjecttreemodel.moc"
