"""Complains of what would stop a workflow of a hosted runner before it starts, or keep it running.

Takes the project's folder. A step runs a command of the project or of the system's packages; an
action is pinned to a major version; a job ends in time.
"""

import os
import re
import sys

import yaml


def complaints_of_step(project, step):
    if "uses" in step:
        if not re.fullmatch(r"[\w.-]+/[\w.-]+@v\d+", step["uses"]):
            yield f"not pinned to a major version: {step['uses']}"
    elif "run" in step:
        command = step["run"].split()[0]
        if command != "apt-get" and not os.access(os.path.join(project, command), os.X_OK):
            yield f"no command of the project: {command}"
    else:
        yield f"a step that does nothing: {step}"


def complaints(project, path):
    with open(path, encoding="utf-8") as file:
        workflow = yaml.safe_load(file)
    # YAML 1.1 reads the key "on" as a truth value.
    if not workflow.get(True):
        yield "nothing starts it"
    for name, job in workflow["jobs"].items():
        if "timeout-minutes" not in job:
            yield f"{name} may run for ever"
        if "runs-on" not in job:
            yield f"{name} runs nowhere"
        for step in job["steps"]:
            yield from complaints_of_step(project, step)


def main():
    project = sys.argv[1]
    folder = os.path.join(project, ".github", "workflows")
    failed = False
    for name in sorted(os.listdir(folder)):
        for complaint in complaints(project, os.path.join(folder, name)):
            print(f"{name}: {complaint}")
            failed = True
    return failed


sys.exit(main())
