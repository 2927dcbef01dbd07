// SPDX-License-Identifier: MIT
#include "measuring/ZtJsonMembers.h"

#include "measuring/ZtJsonReader.h"
#include "support/StatReportTest.h"

namespace {

const QString id = QStringLiteral("id");
const QString name = QStringLiteral("name");
const QString other = QStringLiteral("other");

} // namespace

class ZtJsonMembersTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void findsMembersInAnyOrder();
    void findsNothing();
    void takesTheLastOfEqualKeys();
    void leavesTheObject();
};

void ZtJsonMembersTest::findsMembersInAnyOrder()
{
    const std::string bytes = R"({"other":[{"id":9}],"name":"n","\u0069d":7})";
    ZtJsonReader json(bytes);
    QVERIFY(json.check());
    const ZtJsonMembers members(&json, {&id, &name});
    QVERIFY(members.goTo(id));
    QCOMPARE(json.number(), 7.0);
    QVERIFY(members.goTo(name));
    QCOMPARE(json.text(), QStringLiteral("n"));
    QVERIFY(members.goTo(id));
    // Nobody asked for it.
    QVERIFY(!members.goTo(other));
}

void ZtJsonMembersTest::findsNothing()
{
    const std::string bytes = "{\"i\":1,\"idd\":2,\"\xC3\xAD" "d\":3}";
    ZtJsonReader json(bytes);
    QVERIFY(json.check());
    const ZtJsonMembers members(&json, {&id});
    QVERIFY(!members.goTo(id));
    QCOMPARE(json.position(), bytes.size());
}

void ZtJsonMembersTest::takesTheLastOfEqualKeys()
{
    const std::string bytes = R"({"id":1,"name":2,"id":3})";
    ZtJsonReader json(bytes);
    QVERIFY(json.check());
    const ZtJsonMembers members(&json, {&id});
    QVERIFY(members.goTo(id));
    QCOMPARE(json.number(), 3.0);
}

void ZtJsonMembersTest::leavesTheObject()
{
    const std::string bytes = R"([{"id":1,"name":"x"},5])";
    ZtJsonReader json(bytes);
    QVERIFY(json.check());
    json.enter();
    QVERIFY(json.nextItem());
    const ZtJsonMembers members(&json, {&id});
    QVERIFY(members.goTo(id));
    members.leave();
    QVERIFY(json.nextItem());
    QCOMPARE(json.number(), 5.0);
}

STATREPORT_TEST_MAIN(ZtJsonMembersTest)
#include "ZtJsonMembersTest.moc"
