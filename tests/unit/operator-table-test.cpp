// The operator keys of every sales code, against the codes grouped by what they stand for.

#include "base/zel-svc-active-customer.h"

#include <gtest/gtest.h>

#include <set>
#include <sstream>
#include <string>
#include <vector>

namespace {

struct Group {
    int operator_id;
    int country;
    int region;
    int sim;
    const char *codes;
};

// clang-format off
const std::vector<Group> kGroups = {
    {0, 0, 0, 0, "KOR"},
    {0, 1, 0, 0, "TLP XSA OPP BST CJS FJI"},
    {0, 2, 0, 0, "ATO DRG MAP MOA MOO MOP MOR ONY TRP"},
    {0, 3, 0, 0, "BSE PHB XEB TLB"},
    {0, 5, 0, 0, "CRP TRA TWO"},
    {0, 6, 0, 0, "ETL KBN OSK PGP PGS XCS XEZ"},
    {0, 7, 1, 0, "TDC"},
    {0, 9, 1, 0, "DNF ELS SAU TSF"},
    {0, 10, 0, 0, "XEF AUC BOG CAR DIG DTL NRJ ORC OUT TL2 UNI VGF ZER"},
    {0, 11, 0, 0, "DBT DTO EPL EPR VIT XEG"},
    {0, 12, 0, 0, "COS EUR GRB TGR"},
    {0, 13, 0, 0, "PAN PAP SHA WSP WST XEH"},
    {0, 14, 0, 0, "EIR MET TSI XEI"},
    {0, 16, 0, 0, "ITV CIT FWB GOM MTV O3I PIT TIM WIN XET"},
    {0, 19, 0, 0, "AHN DEP ING KPN KPP KPS ONL PHN RAB RAP TE2 TEP TFT TNS XEN"},
    {0, 20, 0, 0, "NZC"},
    {0, 21, 1, 0, "TEN TNO TPN"},
    {0, 22, 0, 0, "XEO CRT ERA NET PLS POL PRT"},
    {0, 23, 0, 0, "CVT TMN TPH UZO XEP ZON"},
    {0, 24, 0, 0, "MOT SIO"},
    {0, 25, 0, 0, "XFA XFC XFE XFM"},
    {0, 26, 0, 0, "BIT EUS FOP ONO TCB XEC XES TEE"},
    {0, 27, 1, 0, "BAU BCN BHK BME BNA BNB BNO BNR BSG BTH CHS COV NEE "
     "NCM ODK SEA SEN SNF TDK TLA TSN VDS XDN XEE XER XSF"},
    {0, 28, 0, 0, "AUT MAS MOZ ORR SUN SUR SUU SUW SWR"},
    {0, 29, 0, 0, "TUR TRC"},
    {0, 30, 0, 0, "XEU ASD BTU CPW TSC VIR"},
    {0, 32, 0, 0, "AZC ERS MTS SCA SER SRA SVZ"},
    {0, 33, 0, 0, "BEE MDC SEK SRK"},
    {0, 34, 0, 0, "COA HAT"},
    {0, 35, 0, 0, "BGM LMT SEB"},
    {0, 37, 0, 0, "LRT OMT"},
    {0, 38, 0, 0, "D3K MSR PKO SMO TOP TSR VAL"},
    {0, 39, 0, 0, "AVF EGL"},
    {0, 40, 0, 0, "AKS BEL KCL SKZ"},
    {0, 41, 0, 0, "IRD O2S"},
    {0, 42, 0, 0, "MBP MKO VIM"},
    {0, 43, 0, 0, "CMF GBL OMX VVT"},
    {0, 45, 0, 0, "XSG LEV ARB QAT"},
    {0, 46, 0, 0, "XSP SIN MM1 STH"},
    {0, 47, 0, 0, "MAL MIS CCM DGI UMB"},
    {0, 49, 1, 0, "ICL"},
    {0, 50, 0, 0, "CYO"},
    {0, 52, 0, 0, "XTC GLB SMA XTE RED"},
    {0, 55, 0, 0, "INU INS"},
    {0, 62, 0, 0, "MAT MED MWD WAN FWD"},
    {0, 63, 0, 0, "LUX"},
    {0, 64, 0, 0, "PMN TEM"},
    {0, 65, 0, 0, "TMA TMC"},
    {0, 66, 0, 0, "BHO BHT ERO TEB"},
    {0, 67, 0, 0, "THR"},
    {0, 68, 0, 0, "SAR XSE AXI"},
    {0, 69, 0, 0, "XEV XXV"},
    {0, 70, 0, 0, "THL"},
    {0, 71, 0, 0, "PAK"},
    {0, 72, 0, 0, "OAR"},
    {0, 73, 0, 0, "ABS DRC LST OTU TUN"},
    {0, 74, 0, 0, "NPL"},
    {0, 75, 0, 0, "ETR TML"},
    {0, 76, 0, 0, "SLK"},
    {0, 77, 0, 0, "AFR KEN SAF"},
    {0, 78, 0, 0, "ARZ ECT"},
    {1, 1, 0, 0, "VAU"},
    {1, 2, 0, 0, "MOB"},
    {1, 3, 0, 0, "PRO"},
    {1, 5, 0, 0, "VIP"},
    {1, 6, 0, 0, "VDC"},
    {1, 10, 0, 0, "SFR"},
    {1, 11, 0, 0, "VD2"},
    {1, 11, 0, 1, "VDR"},
    {1, 12, 0, 0, "VGR"},
    {1, 13, 0, 0, "VDH"},
    {1, 14, 0, 0, "VDI VDE"},
    {1, 16, 0, 0, "OMN"},
    {1, 18, 0, 0, "VOM"},
    {1, 19, 0, 0, "VDF"},
    {1, 19, 0, 1, "VDP"},
    {1, 20, 0, 0, "VNZ"},
    {1, 23, 0, 0, "TCL"},
    {1, 24, 0, 0, "SIM"},
    {1, 25, 0, 0, "XFV"},
    {1, 26, 0, 0, "ATL"},
    {1, 28, 0, 0, "SWC"},
    {1, 30, 0, 0, "VOD"},
    {1, 30, 0, 1, "VOP"},
    {1, 34, 0, 0, "CNX"},
    {1, 43, 0, 0, "MTL"},
    {1, 50, 0, 0, "CYV"},
    {2, 2, 0, 0, "MAX TRG"},
    {2, 5, 0, 0, "CRO CRG"},
    {2, 6, 0, 0, "TMZ"},
    {2, 11, 0, 0, "DTM DTR"},
    {2, 13, 0, 0, "TMH"},
    {2, 19, 0, 0, "TNL TNN TNP"},
    {2, 30, 0, 0, "TMP TMU"},
    {2, 41, 0, 0, "TMS"},
    {2, 42, 0, 0, "MBM"},
    {2, 64, 0, 0, "TMT"},
    {3, 2, 0, 0, "ONE"},
    {3, 3, 0, 0, "MST"},
    {3, 10, 0, 0, "FTM FTB ORN"},
    {3, 22, 0, 0, "IDE"},
    {3, 23, 0, 0, "OPT"},
    {3, 26, 0, 0, "AMN"},
    {3, 28, 0, 0, "ORG"},
    {3, 30, 0, 0, "ORA"},
    {3, 34, 0, 0, "ORO"},
    {3, 41, 0, 0, "ORS"},
    {4, 6, 0, 0, "O2C"},
    {4, 11, 0, 0, "VIA"},
    {4, 11, 0, 1, "VID"},
    {4, 14, 0, 0, "O2I"},
    {4, 30, 0, 0, "O2U"},
    {4, 30, 0, 1, "O2P"},
    {6, 1, 0, 0, "HUT"},
    {6, 2, 0, 0, "DRE"},
    {6, 7, 0, 0, "HTD"},
    {6, 14, 0, 0, "3IE"},
    {6, 16, 0, 0, "HUI ITA"},
    {6, 27, 0, 0, "HTS"},
    {6, 30, 0, 0, "H3G"},
    {7, 0, 0, 0, "SKT"},
    {8, 0, 0, 0, "KTT"},
    {9, 0, 0, 0, "LGT"},
    {10, 17, 0, 0, "DCM"},
    {34, 1, 0, 0, "OPS"},
    {39, 26, 0, 0, "YOG"},
    {46, 15, 0, 0, "CEL"},
    {47, 15, 0, 0, "PTR"},
    {48, 15, 0, 0, "PCL"},
    {49, 1, 0, 0, "VMA"},
    {50, 1, 0, 0, "TEL"},
    {51, 20, 0, 0, "TNZ"},
};
// clang-format on

constexpr std::size_t kListedCodes = 347;

void expect_row(const std::string &code, const Group &expected) {
    const ZelSvcOperatorRow &row = zel_svc_operator_row(code);
    EXPECT_EQ(row.code, code);
    EXPECT_EQ(row.operator_id, expected.operator_id) << code;
    EXPECT_EQ(row.country, expected.country) << code;
    EXPECT_EQ(row.region, expected.region) << code;
    EXPECT_EQ(row.sim, expected.sim) << code;
}

void expect_unknown(const std::string &code) {
    const ZelSvcOperatorRow &row = zel_svc_operator_row(code);
    EXPECT_TRUE(row.code.empty()) << code;
    EXPECT_EQ(row.operator_id + row.country + row.region + row.sim, 0) << code;
}

} // namespace

TEST(OperatorTable, EveryListedCodeHasItsFourNumbers) {
    std::set<std::string> seen;
    for (const Group &group : kGroups) {
        std::istringstream codes{group.codes};
        for (std::string code; codes >> code; seen.insert(code))
            expect_row(code, group);
    }
    EXPECT_EQ(seen.size(), kListedCodes);
}

TEST(OperatorTable, ARepeatedCodeTakesItsFirstRow) {
    const ZelSvcOperatorRow &row = zel_svc_operator_row("FTM");
    EXPECT_EQ(row.operator_id, 3);
    EXPECT_EQ(row.country, 10);
}

TEST(OperatorTable, AnUnknownCodeIsTheEmptyRow) {
    for (const char *code : {"", "DEF", "ZZZ", "XF", "XFVV", "xfv", "XFV "})
        expect_unknown(code);
}
