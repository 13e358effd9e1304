// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

import assert from "node:assert/strict";
import { describe, test } from "node:test";
import { allKinships, kinshipText, nearKinshipText } from "../src/kinship";
import { english, german, type Messages } from "../src/messages";
import { Tree } from "./families";

function relation(tree: Tree, focus: string, name: string, messages: Messages = english): string {
    const kinship = allKinships(tree.persons, tree.families, tree.id(focus)).get(tree.id(name));
    return kinship ? kinshipText(kinship, tree.sexOf(name), messages) : "";
}

// Each row: who, in English, in German.
function expectRows(tree: Tree, focus: string, rows: readonly (readonly [string, string, string])[]): void {
    for (const [name, inEnglish, inGerman] of rows) {
        assert.equal(relation(tree, focus, name), inEnglish, `${name}, seen from ${focus}`);
        assert.equal(relation(tree, focus, name, german), inGerman, `${name}, seen from ${focus}, in German`);
    }
}

describe("the direct line", () => {
    const tree = new Tree(
        "Adam + Eva: Seth.m",
        "Seth + Sara: Noah.m",
        "Noah + Nora: Otto.m",
        "Otto + Olga: Paul.m",
        "Paul + Pia: Quin.m",
        "Quin + Queenie: Rolf.m Rosa.f",
        "Rolf + Rita: Theo.m",
    );

    test("ancestors carry one great for each generation beyond the grandparents", () => {
        expectRows(tree, "Theo", [
            ["Rolf", "father", "Vater"],
            ["Rita", "mother", "Mutter"],
            ["Quin", "grandfather (father's father)", "Großvater väterlicherseits"],
            ["Paul", "great-grandfather (father's side)", "Urgroßvater väterlicherseits"],
            ["Olga", "great-great-grandmother (father's side)", "Ururgroßmutter väterlicherseits"],
            ["Noah", "great-great-great-grandfather (father's side)", "Urururgroßvater väterlicherseits"],
            ["Sara", "4th great-grandmother (father's side)", "4×Urgroßmutter väterlicherseits"],
        ]);
    });

    test("descendants do the same", () => {
        expectRows(tree, "Seth", [
            ["Noah", "son", "Sohn"],
            ["Otto", "grandson", "Enkel"],
            ["Paul", "great-grandson", "Urenkel"],
            ["Quin", "great-great-grandson", "Ururenkel"],
            ["Rosa", "great-great-great-granddaughter", "Urururenkelin"],
            ["Theo", "4th great-grandson", "4×Urenkel"],
        ]);
    });

    test("the focus is itself, and a stranger has no relation", () => {
        const strangers = new Tree("Ada + Ben: Cid.m", "Dora.f + Egon.m: Fred.m");
        expectRows(strangers, "Cid", [
            ["Cid", "the person in focus", "die Person im Mittelpunkt"],
            ["Fred", "", ""],
        ]);
        assert.equal(allKinships(strangers.persons, strangers.families, 99).size, 0);
    });
});

describe("beside the line", () => {
    const tree = new Tree(
        "Urban + Ursula: Georg.m Gustav.m",
        "Georg + Gerda: Victor.m Vera.f",
        "Gustav + Gisela: Konrad.m",
        "Konrad + Karla: Lukas.m",
        "Lukas + Lotte: Moritz.m",
        "Hans + Hilde: Maria.f Martin.m Marta.f",
        "Victor + Maria: Fritz.m Frida.f",
        "Martin + Monika: Carl.m Clara.f",
        "Clara.f + Claus.m: Dirk.m Dina.f",
        "Frida.f + Ferdi.m: Niko.m Nina.f",
        "Niko + Nele: Olaf.m",
        "Victor + Zoe: Hella.f",
    );

    test("siblings, uncles and aunts say by which parent", () => {
        expectRows(tree, "Fritz", [
            ["Frida", "sister", "Schwester"],
            ["Martin", "uncle (mother's brother)", "Onkel mütterlicherseits"],
            ["Marta", "aunt (mother's sister)", "Tante mütterlicherseits"],
            ["Vera", "aunt (father's sister)", "Tante väterlicherseits"],
            ["Gustav", "great-uncle (father's side)", "Großonkel väterlicherseits"],
        ]);
    });

    test("nephews and nieces", () => {
        expectRows(tree, "Fritz", [
            ["Niko", "nephew", "Neffe"],
            ["Nina", "niece", "Nichte"],
            ["Olaf", "great-nephew", "Großneffe"],
        ]);
    });

    test("cousins count degrees and removals", () => {
        expectRows(tree, "Fritz", [
            ["Clara", "first cousin", "Cousine ersten Grades"],
            ["Dirk", "first cousin once removed", "Neffe zweiten Grades"],
            ["Konrad", "first cousin once removed", "Onkel zweiten Grades"],
            ["Lukas", "second cousin", "Großcousin"],
            ["Moritz", "second cousin once removed", "Neffe dritten Grades"],
        ]);
        expectRows(tree, "Dirk", [
            ["Olaf", "second cousin once removed", "Neffe dritten Grades"],
            ["Niko", "second cousin", "Großcousin"],
            ["Frida", "first cousin once removed", "Tante zweiten Grades"],
        ]);
        expectRows(tree, "Olaf", [["Moritz", "third cousin once removed", "Onkel vierten Grades"]]);
    });

    test("one parent in common, and another each, makes half relations", () => {
        expectRows(tree, "Fritz", [["Hella", "half sister", "Halbschwester"]]);
        expectRows(tree, "Niko", [["Hella", "half aunt (mother's half sister)", "Halbtante mütterlicherseits"]]);
        expectRows(tree, "Hella", [["Niko", "half nephew", "Halbneffe"]]);
    });

    test("a half great-uncle of long ago is counted as one", () => {
        const lines = ["A0 + B0: A1.m", "A0 + C0: D1.m"];
        for (let i = 1; i < 8; ++i) lines.push(`A${i} + B${i}: A${i + 1}.m`);
        const long = new Tree(...lines);
        expectRows(long, "A8", [["D1", "half 6th great-uncle (father's side)", "5×Halburgroßonkel väterlicherseits"]]);
    });

    test("an unknown other parent leaves it open whether a sibling is a half one", () => {
        const open = new Tree("Anton + Berta: Cäsar.m", "Anton + ?: Dora.f");
        assert.equal(relation(open, "Cäsar", "Dora"), "sister");
    });

    test("both sides at once say neither", () => {
        // The parents of Theo are brother and sister.
        const close = new Tree("Abel + Anna: Bert.m Bea.f Bodo.m", "Bert + Bea: Theo.m");
        expectRows(close, "Theo", [
            ["Bodo", "uncle", "Onkel"],
            ["Abel", "grandfather", "Großvater"],
        ]);
    });
});

describe("by marriage", () => {
    const tree = new Tree(
        "Hugo + Helga: Max.m Mona.f",
        "Walter + Wanda: Eva.f Erika.f",
        "Max + Eva: Sven.m Sina.f",
        "Mona.f + Moritz.m",
        "Erika.f + Emil.m: Ella.f",
        "Sven + Svea",
        "Sina.f + Simon.m",
        "Svante + Selma: Svea.f",
        "Rainer | Eva: Ralf.m",
        "Hugo + Ute: Uwe.m",
        "Udo + Ute: Ulla.f",
        "Karl + Kira: Hugo.m Kurt.m",
        "Kurt + Kora: Kim.x",
        "Kim.x + Kai.m",
    );

    test("a couple, married, divorced or neither", () => {
        expectRows(tree, "Max", [["Eva", "wife", "Ehefrau"]]);
        expectRows(tree, "Eva", [
            ["Max", "husband", "Ehemann"],
            ["Rainer", "former husband", "früherer Ehemann"],
        ]);
        const free = new Tree("A + B", "C + D", "E + F", "G + H", "Ida.f ~ Oscar.m");
        expectRows(free, "Ida", [["Oscar", "partner", "Partner"]]);
        expectRows(free, "Oscar", [["Ida", "partner", "Partnerin"]]);
    });

    test("a file that leaves most marriages out does not make partners of spouses", () => {
        const careless = new Tree("A ~ B", "C ~ D", "E + F");
        assert.equal(relation(careless, "A", "B"), "wife");
    });

    test("parents, children and siblings in law", () => {
        expectRows(tree, "Max", [
            ["Walter", "father-in-law", "Schwiegervater"],
            ["Svea", "daughter-in-law", "Schwiegertochter"],
            ["Simon", "son-in-law", "Schwiegersohn"],
            ["Erika", "sister-in-law (wife's sister)", "Schwägerin (Schwester der Ehefrau)"],
            ["Moritz", "brother-in-law (sister's husband)", "Schwager (Ehemann der Schwester)"],
        ]);
        expectRows(tree, "Eva", [
            ["Mona", "sister-in-law (husband's sister)", "Schwägerin (Schwester des Ehemannes)"],
        ]);
    });

    test("step relations", () => {
        expectRows(tree, "Max", [
            ["Ralf", "stepson", "Stiefsohn"],
            ["Ute", "stepmother", "Stiefmutter"],
            ["Uwe", "half brother", "Halbbruder"],
            ["Ulla", "stepsister", "Stiefschwester"],
        ]);
        expectRows(tree, "Ralf", [
            ["Max", "stepfather", "Stiefvater"],
            ["Sina", "half sister", "Halbschwester"],
        ]);
    });

    test("spouses of far relatives, and relatives of a spouse", () => {
        expectRows(tree, "Max", [
            ["Kora", "wife of an uncle", "Ehefrau eines Onkels"],
            ["Kai", "husband of a first cousin", "Ehemann eines Cousins/Cousine ersten Grades"],
            ["Ella", "wife's niece", "Nichte der Ehefrau"],
            ["Emil", "wife's sister's husband", "Ehemann der Schwester der Ehefrau"],
            ["Rainer", "wife's former husband", "früherer Ehemann der Ehefrau"],
            ["Selma", "son's wife's mother", "Mutter der Ehefrau des Sohnes"],
        ]);
    });

    test("a wife who is a cousin is told as both, and a near relation by blood stays one", () => {
        const cousins = new Tree(
            "Josiah + Sarah: Susannah.f Jos.m",
            "Robert + Susannah: Charles.m Caroline.f",
            "Jos + Bessy: Emma.f Joe.m",
            "Charles + Emma: George.m",
            "Joe + Caroline",
        );
        expectRows(cousins, "Charles", [
            ["Emma", "wife and first cousin", "Ehefrau und Cousine ersten Grades"],
            ["Jos", "father-in-law and uncle (mother's brother)", "Schwiegervater und Onkel mütterlicherseits"],
            [
                "Joe",
                "brother-in-law (sister's husband) and first cousin",
                "Schwager (Ehemann der Schwester) und Cousin ersten Grades",
            ],
        ]);
        expectRows(cousins, "George", [["Emma", "mother", "Mutter"]]);
    });

    test("where there is little room, the near word stands alone", () => {
        const near = (focus: string, name: string): string =>
            nearKinshipText(allKinships(tree.persons, tree.families, tree.id(focus)).get(tree.id(name))!, tree.sexOf(name), english);
        assert.equal(near("Max", "Erika"), "sister-in-law");
        assert.equal(near("Max", "Walter"), "father-in-law");
        assert.equal(near("Sven", "Mona"), "aunt");
        assert.equal(near("Sven", "Hugo"), "grandfather");
        assert.equal(near("Max", "Kora"), "wife of an uncle");
        assert.equal(near("Max", "Max"), "the person in focus");
    });
});

describe("other links than birth", () => {
    const tree = new Tree(
        "Bruno + Birte: Finn.m Fee.f",
        "Anselm + Agnes: Finn.m(adopted) Alma.f",
        "Pelle + Petra: Finn.m(foster) Piet.m",
        "Alois + Amalie: Anselm.m Arno.m",
    );

    test("adoptive and foster relatives are told apart from those by birth", () => {
        expectRows(tree, "Finn", [
            ["Bruno", "father", "Vater"],
            ["Anselm", "adoptive father", "Adoptivvater"],
            ["Petra", "foster mother", "Pflegemutter"],
            ["Fee", "sister", "Schwester"],
            ["Alma", "adoptive sister", "Adoptivschwester"],
            ["Piet", "foster brother", "Pflegebruder"],
            ["Alois", "adoptive grandfather (father's side)", "Adoptivgroßvater väterlicherseits"],
            ["Arno", "adoptive uncle (father's side)", "Adoptivonkel väterlicherseits"],
        ]);
        expectRows(tree, "Anselm", [["Finn", "adopted son", "Adoptivsohn"]]);
        expectRows(tree, "Petra", [["Finn", "foster son", "Pflegesohn"]]);
    });

    test("a stepfather who adopted is an adoptive father, and his child with the mother a half sister", () => {
        const adopted = new Tree("Jan + Mia: Leo.m", "Sam + Mia: Leo.m(adopted) Lea.f");
        assert.equal(relation(adopted, "Leo", "Sam"), "adoptive father");
        assert.equal(relation(adopted, "Leo", "Lea"), "half sister");
    });
});

describe("odd families", () => {
    test("two mothers are two mothers", () => {
        const tree = new Tree("Ann.f + Bea: Cleo.f", "Dan + Dot: Ann.f Dave.m");
        expectRows(tree, "Cleo", [
            ["Ann", "mother", "Mutter"],
            ["Bea", "mother", "Mutter"],
            ["Dave", "uncle (mother's brother)", "Onkel mütterlicherseits"],
        ]);
        expectRows(tree, "Ann", [["Bea", "wife", "Ehefrau"]]);
    });

    test("unknown sex takes neutral words", () => {
        const tree = new Tree("Kim.x + Lou.x: Max.x Nic.x", "Nic.x + Sam.x: Toni.x", "Pat.x + Pip.x: Kim.x Robin.x");
        expectRows(tree, "Max", [
            ["Kim", "parent", "Elternteil"],
            ["Nic", "sibling", "Geschwister"],
            ["Sam", "sibling-in-law (sibling's spouse)", "Schwager/Schwägerin (Ehepartner des Geschwisters)"],
            ["Toni", "niece or nephew", "Neffe/Nichte"],
            ["Pat", "grandparent", "Großelternteil"],
            ["Robin", "aunt or uncle", "Onkel/Tante"],
        ]);
        expectRows(tree, "Kim", [
            ["Max", "child", "Kind"],
            ["Lou", "spouse", "Ehepartner"],
            ["Toni", "grandchild", "Enkelkind"],
        ]);
    });

    test("their own parent, and a loop of parents, end", () => {
        const own = new Tree("Ouro + Mona: Ouro.m Sid.m");
        assert.equal(relation(own, "Ouro", "Ouro"), "the person in focus");
        assert.equal(relation(own, "Ouro", "Sid"), "son");
        const loop = new Tree("Uno + Una: Due.m", "Due + Dora: Tre.m", "Tre + Tina: Uno.m");
        assert.equal(relation(loop, "Uno", "Tre"), "father");
        assert.equal(relation(loop, "Uno", "Due"), "son");
        const couple = new Tree("Solo + Solo");
        assert.equal(relation(couple, "Solo", "Solo"), "the person in focus");
    });

    test("a child that only one side of the file names is still one", () => {
        const tree = new Tree("Ada.f + Bob.m: Cyd.f");
        tree.families[0]!.children.length = 0;
        assert.equal(relation(tree, "Ada", "Cyd"), "daughter");
        const other = new Tree("Ada.f + Bob.m: Cyd.f");
        other.persons[other.id("Cyd") - 1]!.parentFamilies.length = 0;
        other.persons[other.id("Cyd") - 1]!.father = 0;
        assert.equal(relation(other, "Cyd", "Bob"), "father");
    });

    test("links that lead nowhere are passed over", () => {
        const tree = new Tree("Ada.f + Bob.m: Cyd.f");
        tree.persons[0]!.spouses.push(77);
        tree.families[0]!.children.push(88);
        tree.persons[2]!.parentFamilies.push({ family: 99, pedigree: "birth" });
        assert.equal(relation(tree, "Cyd", "Ada"), "mother");
    });
});

// Generations of 20 couples; each child marries the neighbour's.
function village(generations: number): Tree {
    const lines: string[] = [];
    for (let g = 0; g < generations; ++g) {
        for (let c = 0; c < 20; ++c) {
            const children = [0, 1].map((n) => (n === 0 ? `m${g + 1}_${c}.m` : `f${g + 1}_${(c + 1) % 20}.f`));
            lines.push(`m${g}_${c} + f${g}_${c}: ${children.join(" ")}`);
        }
    }
    return new Tree(...lines);
}

test("three thousand relatives are told in a moment", () => {
    const tree = village(75);
    allKinships(tree.persons, tree.families, 1);
    const start = performance.now();
    const kinships = allKinships(tree.persons, tree.families, tree.id("m40_7"));
    const took = performance.now() - start;
    console.log(`${tree.persons.length} persons, ${kinships.size} related, ${took.toFixed(1)} ms`);
    assert.equal(kinships.size, tree.persons.length);
    assert.ok(took < 200, `${took} ms`);
});
