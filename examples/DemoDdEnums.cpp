// Data Dictionary enum translators: a few properties of the sample application's types
// and symbols translated to the Data Dictionary's enumerations and back.
#include "DemoSampleApp.h"
#include "DemoSections.h"

#include "HulCvTools/DdEnumTranslators/KvCBaseTypeDDEnumTranslator.h"
#include "HulCvTools/DdEnumTranslators/KvCSymbolClassDDEnumTranslator.h"
#include "platform/icode/KV_DataTypeServer.h"
#include "platform/icode/KvCCodeViewData.h"
#include "platform/icode/KvCNumBaseTypeProps.h"
#include "platform/support/WmCXString.h"
#include "platform/support/wmddapi.h"

void demoDdEnums(DemoRun& run) {
  printSectionTitle(run.out, "Data Dictionary enumerations");
  KV_DataTypeServer* types = run.sample.app.data().getDataTypeServer();
  run.out << "  base types as Data Dictionary kinds:";
  for (const char* name : {"Int8", "UInt16", "Int32", "Float64"}) {
    KV_DataType* type = types->findTypeByName(name, nullptr);
    run.out << " " << name << "="
            << static_cast<int>(KvCBaseTypeDDEnumTranslator::getIcToDDEnumBaseType(type));
  }
  const KvCNumBaseTypeProps::KvTAlignment alignment = KvCNumBaseTypeProps::KV_ALIGN_4;
  const wmddapi::AlignmentEnum ddAlignment =
      KvCBaseTypeDDEnumTranslator::getIcToDDEnumAlignment(alignment);
  run.out << "\n  alignment 4 bytes: ICode " << static_cast<int>(alignment)
          << " -> Data Dictionary " << static_cast<int>(ddAlignment) << " -> ICode "
          << static_cast<int>(KvCBaseTypeDDEnumTranslator::getDDToIcEnumAlignment(ddAlignment));
  run.out << "\n  scopes:";
  for (const char* scope : {"local", "global", "struct_component"}) {
    const WmCXString text(scope);
    run.out << " \"" << scope << "\"="
            << static_cast<int>(KvCSymbolClassDDEnumTranslator::KvScopeStringToDdScopeEnum(&text));
  }
  run.out << "\n";
}
