#include "CheckedTemplate.h"

#include <gtest/gtest.h>

namespace
{

struct Row
{
    const char *was;
    const char *now;
    ExpectedRemarks remarks;
    const char *reason;
};

void expectAll(const std::vector<Row> &rows)
{
    for (const Row &row : rows) {
        expectRemarks(changedTemplate(row.was, row.now), row.remarks, row.reason);
    }
}

TEST(TemplateCheckRecords, RemarksOnVariables)
{
    const char *const end = "        </VariableList>";
    expectAll({
        {end,
         "<Variable><ID>9</ID><VariableName>R</VariableName>¦<Type>Radius</Type></Variable></VariableList>",
         {{"error", "unknown type \"Radius\": the variable \"R\" is left out"}},
         "an unknown type"},
        {end,
         "¦<Variable><ID>9</ID><VariableName>R</VariableName></Variable></VariableList>",
         {{"error", "unknown type \"\": the variable \"R\" is left out"}},
         "no type"},
        {end,
         "<Variable>¦<ID>x9</ID><VariableName>R</VariableName><Type>TEXT</Type></Variable></VariableList>",
         {{"warning", "the identifier \"x9\" counts as 0: a whole number was expected"}},
         "an identifier that is not a number"},
        {end,
         "<Variable>¦<ID>9.5</ID><VariableName>R</VariableName><Type>TEXT</Type></Variable></VariableList>",
         {{"warning", "the identifier \"9.5\" counts as 9: a whole number was expected"}},
         "an identifier that is not a whole number"},
        {end,
         "<Variable>¦<ID>4294967297</ID><VariableName>R</VariableName><Type>TEXT</Type></Variable></VariableList>",
         {{"warning", "the identifier \"4294967297\" counts as 2147483647: a whole number was expected"}},
         "an identifier beyond 32 bits"},
        {end,
         "¦<Variable><VariableName>R</VariableName><Type>TEXT</Type></Variable></VariableList>",
         {{"warning", "the identifier \"\" counts as 0: a whole number was expected"}},
         "no identifier"},
        {end,
         "<Variable><ID>9</ID>¦<VariableName>NUMBER</VariableName><Type>TEXT</Type></Variable></VariableList>",
         {{"warning", "the variable \"NUMBER\" is in the dictionary twice: the last one counts"}},
         "a variable twice, in any case"},
        {end,
         "¦<Variable><ID>2</ID><VariableName>R</VariableName><Type>TEXT</Type></Variable></VariableList>",
         {{"warning", "the variables \"Northing\" and \"R\" share the identifier 2"}},
         "an identifier twice"},
        {"      <Dictionary>",
         "      ¦<Dictionary><VariableList></VariableList></Dictionary><Dictionary>",
         {{"error", "the dictionary has no <DictionaryName>"}},
         "a dictionary without a name"},
    });
}

TEST(TemplateCheckRecords, RemarksOnTablesAndBlocks)
{
    const char *const table = "    </Tables>";
    const char *const block = "    </Blocks>";
    const char *const field = "<Field><VariableName>Number</VariableName></Field>";
    const std::string list = std::string("<OutputList>") + field + "</OutputList>";
    const std::string namelessTable = "¦<Table><Use>PointDic</Use>" + list + "</Table></Tables>";
    const std::string namelessBlock = "¦<Block><Use>PointDic</Use>" + list + "</Block></Blocks>";
    const std::string unusedTable = "¦<Table><Name>A</Name>" + list + "</Table></Tables>";
    const std::string unusedBlock = "<Block><Name>A</Name>¦<Use>Else</Use>" + list + "</Block></Blocks>";
    expectAll({
        {"        <Name>Points</Name>\n        <Use>pointdic</Use>",
         "        <Name>Points</Name>\n        ¦<Use>Nowhere</Use>",
         {{"error", "there is no dictionary named \"Nowhere\": \"Points\" cannot be written"}},
         "a table whose dictionary is missing"},
        {block,
         unusedBlock.c_str(),
         {{"error", "there is no dictionary named \"Else\": \"A\" cannot be written"}},
         "a block whose dictionary is missing"},
        {table,
         unusedTable.c_str(),
         {{"error", "there is no dictionary named \"\": \"A\" cannot be written"}},
         "a table that names no dictionary"},
        {table, namelessTable.c_str(), {{"error", "the table has no <Name>"}}, "a table without a name"},
        {block, namelessBlock.c_str(), {{"error", "the block has no <Name>"}}, "a block without a name"},
        {table,
         "¦<Table><Name>Bare</Name><Use>PointDic</Use></Table></Tables>",
         {{"warning", "\"Bare\" has no fields"}},
         "a table without fields"},
        {block,
         "¦<Block><Name>Bare</Name><Use>PointDic</Use></Block></Blocks>",
         {{"warning", "\"Bare\" has no fields"}},
         "a block without fields"},
        {"<Sort><VariableName>Number</VariableName>",
         "<Sort><VariableName>Number</VariableName>¦<VariableName>Nix</VariableName>",
         {{"error", "the sort key \"Nix\" is not in the dictionary \"pointdic\""}},
         "a sort key that the dictionary lacks"},
    });
}

TEST(TemplateCheckRecords, RemarksOnFields)
{
    const char *const inTable = "<Label>Point</Label><Format>8</Format>";
    const char *const inBlock = "<Format>3</Format><Align>left</Align>";
    expectAll({
        {"<Field><VariableName>Number",
         "<Field>¦<VariableName>Nix</VariableName></Field><Field><VariableName>Number",
         {{"error", "the dictionary has no variable \"Nix\": the column cannot be filled"}},
         "a column whose variable the dictionary lacks"},
        {"<Field><VariableName>Number",
         "¦<Field><Label>x</Label></Field><Field><VariableName>Number",
         {{"error", "the dictionary has no variable \"\": the column cannot be filled"}},
         "a column without a variable"},
        {"<Field><VariableName>northing",
         "<Field>¦<VariableName>Nix</VariableName></Field><Field><VariableName>northing",
         {{"error", "the dictionary has no variable \"Nix\": the line repeats the value before it"}},
         "a line whose variable the dictionary lacks"},
        {inTable,
         "¦<Label>Point number</Label><Format>8</Format>",
         {{"warning", "the label \"Point number\" is wider than its column of 8: the column takes its width"}},
         "a label wider than its column"},
        {inTable,
         "¦<Label>Pt</Label><Format>1.3</Format>",
         {{"warning", "the label \"Pt\" is wider than its column of 1: the column takes its width"}},
         "a label one character too wide"},
        {inTable,
         "<Label>Point</Label>¦<Format>32768</Format>",
         {{"error", "the format \"32768\" is beyond 32767 characters"}},
         "a width that must be a mistake"},
        {inTable, "<Label>Point</Label><Format>32767</Format>", {}, "the widest column"},
        {inTable,
         "<Label>Point</Label>¦<Format>8.40000</Format>",
         {{"error", "the format \"8.40000\" is beyond 32767 characters"}},
         "decimals that must be a mistake"},
        {inBlock,
         "¦<Format>-99999999999</Format>",
         {{"error", "the format \"-99999999999\" is beyond 32767 characters"}},
         "a negative width that must be a mistake"},
        {"<Align>RIGHT</Align>",
         "¦<Align>RIGTH</Align>",
         {{"warning", "the alignment \"RIGTH\" counts as LEFT: did you mean \"RIGHT\"?"}},
         "an unknown alignment"},
        {inBlock,
         "<Format>3</Format>¦<Align>CENTER</Align>",
         {{"warning", "the alignment \"CENTER\" counts as LEFT"}},
         "a block is never centred"},
        {inBlock, "<Format>3</Format><Align>Right</Align>", {}, "a block can be aligned right"},
    });
}

TEST(TemplateCheckRecords, RemarksOnFormatsThatAreNone)
{
    const char *const inTable = "<Label>Point</Label><Format>8</Format>";
    const struct
    {
        const char *format;
        const char *read;
    } rows[] = {{"10,3", "10.0"}, {"10.x", "10.0"}, {"8.2.2", "8.2"}, {"8.", "8.0"},  {".2", "0.2"},
                {"8 2", "8.0"},   {"8cm", "8.0"},   {"x", "0.0"},     {"8.-1", "8.0"}};
    for (const auto &row : rows) {
        const std::string now = std::string("<Label></Label>¦<Format>") + row.format + "</Format>";
        const std::string remark = std::string("the format \"") + row.format + "\" counts as " + row.read +
                                   ": a width such as 12, or a width and decimals such as 12.3, was expected";
        expectRemarks(changedTemplate(inTable, now.c_str()), {{"warning", remark.c_str()}}, row.format);
    }
}

TEST(TemplateCheckRecords, NamesWhatMayHaveBeenMeant)
{
    expectAll({
        {"<Use>pointdic</Use>",
         "¦<Use>pointdict</Use>",
         {{"error", "there is no dictionary named \"pointdict\": \"Points\" cannot be written: did you mean "
                    "\"PointDic\"?"}},
         "a dictionary"},
        {"        </VariableList>",
         "<Variable><ID>9</ID><VariableName>R</VariableName>¦<Type>Coordinates</Type></Variable></VariableList>",
         {{"error", "unknown type \"Coordinates\": the variable \"R\" is left out: did you mean \"COORDINATE\"?"}},
         "a type"},
        {"<Sort><VariableName>Number",
         "<Sort>¦<VariableName>Nummer",
         {{"error", "the sort key \"Nummer\" is not in the dictionary \"pointdic\": did you mean \"Number\"?"}},
         "a sort key"},
        {"<Field><VariableName>northing",
         "<Field>¦<VariableName>north",
         {{"error", "the dictionary has no variable \"north\": the line repeats the value before it: did you mean "
                    "\"Northing\"?"}},
         "a variable"},
    });
}

TEST(TemplateCheckRecords, RemarksOnNamesThatStandTwice)
{
    const std::string list =
        "<Use>PointDic</Use><OutputList><Field><VariableName>Number</VariableName></Field></OutputList>";
    const std::string table = "<Table>¦<Name>POINTS</Name>" + list + "</Table></Tables>";
    const std::string block = "<Block>¦<Name>site</Name>" + list + "</Block></Blocks>";
    expectAll({
        {"    </Tables>",
         table.c_str(),
         {{"warning", "a table named \"POINTS\" comes before this one: the first one of a name is written"}},
         "a table"},
        {"    </Blocks>",
         block.c_str(),
         {{"warning", "a block named \"site\" comes before this one: the first one of a name is written"}},
         "a block"},
        {"    </Dictionaries>",
         "<Dictionary>¦<DictionaryName>POINTDIC</DictionaryName><VariableList></VariableList></Dictionary></Dictionaries>",
         {{"warning", "a dictionary named \"POINTDIC\" comes before this one: the variables of both count together"}},
         "a dictionary"},
    });
}

TEST(TemplateCheckRecords, APercentSignOfAValueIsQuotedAsItIs)
{
    const char *const inTable = "<Label>Point</Label><Format>8</Format>";
    expectAll({
        {inTable,
         "¦<Label>%1 grade</Label><Format>2</Format>",
         {{"warning", "the label \"%1 grade\" is wider than its column of 2: the column takes its width"}},
         "in a label"},
        {inTable,
         "<Label>Point</Label>¦<Format>99999%2</Format>",
         {{"error", "the format \"99999%2\" is beyond 32767 characters"}},
         "in a format"},
        {"<Variable><ID>1</ID>",
         "<Variable>¦<ID>%1</ID>",
         {{"warning", "the identifier \"%1\" counts as 0: a whole number was expected"}},
         "in an identifier"},
    });
}

} // namespace
