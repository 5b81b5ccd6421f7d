declare module "brindle-module" {
  export default function createModule(options: object): Promise<import("./Native").Module>;
}
