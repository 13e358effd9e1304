// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A family tree in React: the family is the program's own, and what is changed in it is drawn at once.

import { sharedEngine } from "olvane-tree";
import { useState } from "react";
import { createRoot } from "react-dom/client";

const olvane = await sharedEngine();
const family = olvane.family({
    persons: [
        { id: 1, given: "Karl", surname: "Berg", sex: "m", birth: "1850" },
        { id: 2, given: "Anna", surname: "Holm", sex: "f", birth: "1852" },
        { id: 3, given: "Ida", surname: "Berg", sex: "f", birth: "1880", father: 1, mother: 2 },
    ],
});

function Editor({ person }) {
    const [name, setName] = useState(person.name);
    const rename = (event) => {
        event.preventDefault();
        family.setNames(Number(person.xref), [{ text: name }]);
    };
    return (
        <form onSubmit={rename}>
            <input aria-label="Name" value={name} onChange={(event) => setName(event.target.value)} />
            <button>Rename</button>
        </form>
    );
}

function App() {
    const [selected, setSelected] = useState(null);
    const [view, setView] = useState("family");
    return (
        <>
            <select aria-label="View" value={view} onChange={(event) => setView(event.target.value)}>
                {["family", "hourglass", "descendants", "fan"].map((name) => (
                    <option key={name}>{name}</option>
                ))}
            </select>
            <olvane-tree
                style={{ height: "30rem" }}
                data={family}
                focus="1"
                view={view}
                onselect={(event) => setSelected(event.detail.person)}
            />
            {selected && <Editor key={selected.xref} person={selected} />}
        </>
    );
}

createRoot(document.querySelector("#app")).render(<App />);
