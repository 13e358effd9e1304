// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// GEDCOM files that are made rather than written.

const kHead = ["0 HEAD", "1 GEDC", "2 VERS 5.5.1", "2 FORM LINEAGE-LINKED", "1 CHAR UTF-8"];

export function gedcom(...lines) {
    return [...kHead, ...lines, "0 TRLR", ""].join("\n");
}

/**
 * A number of uncles in one house, with a number of children each: seen from any of the children, all are in the picture.
 * I1 and I2 are the grandparents, I3 the first uncle, and the first cousin has the record C0_0.
 */
export function cousins(uncles, children) {
    const persons = [
        "0 @I1@ INDI",
        "1 NAME Adam /Old/",
        "1 SEX M",
        "1 FAMS @F0@",
        "0 @I2@ INDI",
        "1 NAME Eve /Old/",
        "1 SEX F",
        "1 FAMS @F0@",
    ];
    const families = ["0 @F0@ FAM", "1 HUSB @I1@", "1 WIFE @I2@", "1 MARR Y"];
    const ofUncles = [];
    for (let u = 0; u < uncles; ++u) {
        families.push(`1 CHIL @U${u}@`);
        persons.push(
            `0 @U${u}@ INDI`,
            `1 NAME Uncle${u} /Old/`,
            "1 SEX M",
            "1 BIRT",
            "2 DATE 1900",
            "1 FAMC @F0@",
            `1 FAMS @FU${u}@`,
        );
        persons.push(`0 @W${u}@ INDI`, `1 NAME Wife${u} /New/`, "1 SEX F", `1 FAMS @FU${u}@`);
        ofUncles.push(`0 @FU${u}@ FAM`, `1 HUSB @U${u}@`, `1 WIFE @W${u}@`, "1 MARR Y");
        for (let c = 0; c < children; ++c) {
            ofUncles.push(`1 CHIL @C${u}_${c}@`);
            persons.push(
                `0 @C${u}_${c}@ INDI`,
                `1 NAME Child${u} No${c} /Old/`,
                c % 2 ? "1 SEX F" : "1 SEX M",
                "1 BIRT",
                `2 DATE ${1925 + (c % 20)}`,
                `1 FAMC @FU${u}@`,
            );
        }
    }
    return gedcom(...persons, ...families, ...ofUncles);
}

// Each records whether it was taken for more than text.
const kAttempts = [
    "<script>window.wasRun=1</script>",
    "</script><script>window.wasRun=2</script>",
    "<img src=x onerror=window.wasRun=3>",
    "<img src=http://olvane.invalid/a.png>",
    '"><svg onload=window.wasRun=4>',
    "'\" onmouseover=window.wasRun=5 x='",
    "javascript:window.wasRun=6",
    "${window.wasRun=7} {{window.wasRun=8}}",
    "&lt;b&gt; &amp; &#x3c;i&#x3e; <b>bold</b>",
    "]]><!-- --> <![CDATA[",
    "url(http://olvane.invalid/b.png)",
    "<style>*{background:url(http://olvane.invalid/c)}</style>",
    "<iframe src=http://olvane.invalid/d></iframe>",
    "__proto__ constructor toString",
    "../../etc/passwd%00.svg",
    "\u202etxet desrever\u202c and \u2066isolated\u2069",
    "\u200b\u200d\ufeff zero width",
    "A\u0300\u0301\u0302\u0303\u0304\u0305".repeat(40),
    "Hubert".repeat(3000),
    "𝕌𝕟𝕚 👨‍👩‍👧‍👦 李 דוד محمد",
];

/** Parents, a focus whose name is the first attempt, and a child, R1 and on, for each of the others. */
export function hostileFamily() {
    const [first, ...others] = kAttempts;
    const lines = [
        "0 @R0@ INDI",
        `1 NAME ${first} /Focus/`,
        "1 SEX M",
        "1 FAMS @F1@",
        "0 @F1@ FAM",
        "1 HUSB @R0@",
        "1 MARR",
        `2 PLAC ${kAttempts[3]}`,
    ];
    const persons = [];
    others.forEach((attempt, i) => {
        const n = i + 1;
        lines.push(`1 CHIL @R${n}@`);
        persons.push(`0 @R${n}@ INDI`, `1 NAME ${attempt}`, `1 SEX ${n % 2 ? "F" : attempt}`, "1 FAMC @F1@");
        persons.push(
            "1 BIRT",
            `2 DATE ${attempt}`,
            `2 PLAC ${attempt}`,
            `1 OCCU ${attempt}`,
            "1 EVEN",
            `2 TYPE ${attempt}`,
        );
    });
    return { text: gedcom(...lines, ...persons), names: kAttempts };
}

/** Lines that no reader can take as they stand, around three persons who can be read. */
export function brokenFamily() {
    return [
        "0 HEAD",
        "1 GEDC",
        "2 VERS 5.5.1",
        "0 @I1@ INDI",
        "1 NAME Ada /Whole/",
        "1 SEX F",
        "1 FAMS @F1@",
        "this is no line at all",
        "7 DATE far too deep",
        "0 @I2@ INDI",
        "1 NAME Bob /Half",
        "1 SEX M",
        "1 BIRT",
        "2 DATE the day <b>before</b> yesterday",
        "1 FAMS @F1@",
        "1 FAMC @F99@",
        "0 @F1@ FAM",
        "1 HUSB @I2@",
        "1 WIFE @I1@",
        "1 CHIL @I3@",
        "1 CHIL @I77@",
        "0 @I3@ INDI",
        "1 NAME Cid /Whole/",
        "1 FAMC @F1@",
        "0 @I3@ INDI",
        "1 NAME Cid again",
    ].join("\n");
}

/** A grandmother, her son, both with letters from right to left, and his daughter with both kinds. */
export function rightToLeftFamily() {
    return gedcom(
        "0 @I1@ INDI",
        "1 NAME רחל /כהן/",
        "1 SEX F",
        "1 BIRT",
        "2 DATE 1890",
        "1 FAMS @F1@",
        "0 @I2@ INDI",
        "1 NAME דוד בן משה /כהן/",
        "1 SEX M",
        "1 BIRT",
        "2 DATE 1920",
        "1 DEAT",
        "2 DATE 1990",
        "1 FAMC @F1@",
        "1 FAMS @F2@",
        "0 @I3@ INDI",
        "1 NAME محمد /الأندلسي/",
        "1 SEX M",
        "1 FAMC @F1@",
        "0 @I4@ INDI",
        "1 NAME Miriam כהן (Cohen)",
        "1 SEX F",
        "1 BIRT",
        "2 DATE 1950",
        "1 FAMC @F2@",
        "0 @F1@ FAM",
        "1 WIFE @I1@",
        "1 CHIL @I2@",
        "1 CHIL @I3@",
        "0 @F2@ FAM",
        "1 HUSB @I2@",
        "1 CHIL @I4@",
    );
}

/** A dead man and his wife, and their children, who are alive. */
export function livingFamily() {
    return gedcom(
        "0 @I1@ INDI",
        "1 NAME Gottfried /Altmann/",
        "1 SEX M",
        "1 BIRT",
        "2 DATE 1 JAN 1880",
        "1 DEAT",
        "2 DATE 2 FEB 1950",
        "1 EVEN",
        "2 TYPE Witness Zacharias Geheimrat",
        "1 RESI",
        "2 PLAC House of Yolanda Versteckt",
        "1 FAMS @F1@",
        "0 @I2@ INDI",
        "1 NAME Walburga /Altmann/",
        "1 SEX F",
        "1 BIRT",
        "2 DATE 1885",
        "1 DEAT Y",
        "1 FAMS @F1@",
        "0 @I3@ INDI",
        "1 NAME Zacharias /Geheimrat/",
        "1 SEX M",
        "1 BIRT",
        "2 DATE 13 MAY 1999",
        "2 PLAC Verborgenstadt",
        "1 OCCU Heimlichtuer",
        "1 FAMC @F1@",
        "1 FAMS @F2@",
        "0 @I4@ INDI",
        "1 NAME Yolanda /Versteckt/",
        "1 SEX F",
        "1 BIRT",
        "2 DATE 14 JUN 2001",
        "1 FAMS @F2@",
        "0 @F1@ FAM",
        "1 HUSB @I1@",
        "1 WIFE @I2@",
        "1 CHIL @I3@",
        "1 MARR",
        "2 DATE 1910",
        "0 @F2@ FAM",
        "1 HUSB @I3@",
        "1 WIFE @I4@",
        "1 MARR",
        "2 DATE 15 JUL 2021",
        "2 PLAC Niemandshausen",
    );
}

/** A man with a thousand wives and five children by each, which asks for more relatives than any picture may; and
 *  somebody beside him. */
export function hugeHousehold() {
    const wives = Array.from({ length: 1000 }, (_, i) => i);
    const children = [0, 1, 2, 3, 4];
    const lines = ["0 HEAD", "0 @MAN@ INDI", "1 NAME Harald /Many/", "1 SEX M", ...wives.map((i) => `1 FAMS @F${i}@`)];
    for (const i of wives) {
        lines.push(`0 @W${i}@ INDI`, `1 NAME Wife /${i}/`, "1 SEX F", `1 FAMS @F${i}@`);
        for (const k of children) lines.push(`0 @C${i}x${k}@ INDI`, `1 NAME Child /${i}/`, `1 FAMC @F${i}@`);
        lines.push(`0 @F${i}@ FAM`, "1 HUSB @MAN@", `1 WIFE @W${i}@`, ...children.map((k) => `1 CHIL @C${i}x${k}@`));
    }
    return [...lines, "0 @LONE@ INDI", "1 NAME Lone /Stranger/", "0 TRLR"].join("\n");
}

/** Lines of notes, sources, media and the like in the file of detailedFamily(), each with a word of its own. */
export const kDetailWords = [
    "Rosenholz",
    "Zweitnotiz",
    "Gemeinschaftsnotiz",
    "Weiterzeile",
    "Kirchenbuch",
    "Pfarrer",
    "Druckerei",
    "Blatt 17",
    "Wortlaut",
    "Fieber",
    "63y",
    "Standesamt",
    "Lindenallee",
    "Hinterhof",
    "Ehenamen",
    "Spitzname",
    "Taufzeuge",
    "29y",
    "Hochzeitsnotiz",
    "Portraitbild",
    "https://example.org/berta",
];

/** A couple of whom the file knows more than dates and places, and their son. */
export function detailedFamily() {
    return gedcom(
        "0 @I1@ INDI",
        "1 NAME Berta /Rose/",
        "2 NICK Spitzname",
        "2 SOUR @S1@",
        "3 PAGE Blatt 17",
        "3 QUAY 3",
        "3 DATA",
        "4 TEXT Wortlaut der Quelle",
        "1 NAME Berta /Ehenamen/",
        "2 TYPE married",
        "1 SEX F",
        "1 DEAT",
        "2 DATE 3 MAR 1901",
        "2 PLAC Bern",
        "2 CAUS Fieber",
        "2 AGE 63y",
        "2 AGNC Standesamt Bern",
        "1 RESI",
        "2 DATE 1870",
        "2 ADDR Lindenallee 4",
        "3 CONT Hinterhof",
        "1 BIRT",
        "2 DATE 1 FEB 1838",
        "1 OCCU Weberin",
        "1 EVEN",
        "2 TYPE Taufzeuge",
        "2 DATE 1860",
        "1 NOTE Rosenholz stand im Zimmer",
        "1 NOTE Zweitnotiz javascript:alert(1) <b>fett</b>",
        "1 NOTE @N1@",
        "1 WWW https://example.org/berta",
        "1 WWW javascript:window.wasRun=1",
        "1 OBJE",
        "2 FILE portrait.jpg",
        "2 TITL Portraitbild",
        "2 FORM jpeg",
        "1 OBJE @M1@",
        "1 FAMS @F1@",
        "0 @I2@ INDI",
        "1 NAME Anton /Rose/",
        "1 SEX M",
        "1 BIRT",
        "2 DATE 1830",
        "1 DEAT Y",
        "1 FAMS @F1@",
        "0 @I3@ INDI",
        "1 NAME Carl /Rose/",
        "1 SEX M",
        "1 BIRT",
        "2 DATE 1865",
        "1 DEAT",
        "2 DATE 1930",
        "1 FAMC @F1@",
        "0 @F1@ FAM",
        "1 HUSB @I2@",
        "1 WIFE @I1@",
        "1 CHIL @I3@",
        "1 MARR",
        "2 DATE 1864",
        "2 WIFE",
        "3 AGE 29y",
        "1 NOTE Hochzeitsnotiz",
        "0 @S1@ SOUR",
        "1 TITL Kirchenbuch von Bern",
        "1 AUTH Pfarrer Muster",
        "1 PUBL Druckerei Muster",
        "0 @N1@ NOTE Gemeinschaftsnotiz",
        "1 CONT Weiterzeile",
        "0 @M1@ OBJE",
        "1 FILE ../outside.jpg",
        "2 FORM jpeg",
        "2 TITL Von anderswo",
    );
}

/** A line of descent of that many generations. */
export function lineOf(generations) {
    const lines = ["0 HEAD", "1 GEDC", "2 VERS 5.5.1", "1 CHAR UTF-8"];
    for (let i = 1; i <= generations; ++i) {
        lines.push(
            `0 @I${i}@ INDI`,
            `1 NAME Given${i} /Line/`,
            "1 SEX M",
            "1 BIRT",
            `2 DATE ${1000 + (i % 900)}`,
            "2 PLAC Some town, Some land",
        );
        if (i > 1) lines.push(`1 FAMC @F${i - 1}@`);
        lines.push(`1 FAMS @F${i}@`, `0 @F${i}@ FAM`, `1 HUSB @I${i}@`);
        if (i < generations) lines.push(`1 CHIL @I${i + 1}@`);
    }
    return [...lines, "0 TRLR"].join("\n");
}

/** A couple with everything that boxes and lines can say beside names and years. */
export const kFactFamily = gedcom(
    ...["0 @I1@ INDI", "1 NAME Ada /Lee/", "1 SEX F", "1 OCCU Baker", "1 FAMS @F1@"],
    ...["1 BIRT", "2 DATE 12 FEB 1809", "2 PLAC Bath", "1 DEAT", "2 DATE 19 APR 1882", "2 PLAC Hove"],
    ...["0 @I2@ INDI", "1 NAME Jon /Lee/", "1 SEX M", "1 FAMS @F1@"],
    ...["0 @F1@ FAM", "1 HUSB @I2@", "1 WIFE @I1@", "1 MARR", "2 DATE 29 JAN 1839"],
);
