#pragma once

#include "config/config_record.h"

#include <wx/frame.h>
#include <wx/treebase.h>

#include <memory>
#include <vector>

class wxCloseEvent;
class wxFlexGridSizer;
class wxGridEvent;
class wxSizer;
class wxToolBar;
class wxTreeCtrl;
class wxTreeEvent;

// The main window. Every handler of the program is one of its members; they are defined
// where their subject lives (pages/, tree/, config/file_commands.cpp, app/).
class ConfigFrame : public wxFrame
{
  public:
    ConfigFrame(wxWindow* parent, wxWindowID id, const wxString& title, const wxPoint& pos,
                const wxSize& size, long style = wxDEFAULT_FRAME_STYLE);
    ~ConfigFrame() override;

    // Controls are looked up each time, never kept; nullptr means "skip the control".
    template <class T> T* FindCtrl(int id) const { return dynamic_cast<T*>(FindWindow(id)); }
    wxTreeCtrl* Tree() const;
    // Widens (or heightens) the window where a page would not fit in the page host.
    void GrowToShowPages();

    const ConfigRecord& Config() const { return *m_config; }
    ConfigRecord& Config() { return *m_config; }

    // File operations, used by start-up, Generate and close.
    bool LoadConfig(const wxString& path);
    bool SaveConfig();
    bool SaveConfigAs();

    // The option tree, a view of the record.
    void BuildOptionTree();
    static wxTreeItemId FindNodeByPageId(wxTreeCtrl* tree, int pageId, const wxTreeItemId& parent);
    // The label of a node with a value, filled from the record.
    wxString NodeLabel(int pageId) const;
    // Rewrites one node's label from the record; does nothing when the node is not in the tree.
    void RefreshNodeLabel(int pageId);

    // Page selection.
    void ShowPage(wxWindow* page, int pageId);
    void RefreshCurrentPage();
    void FillActiveLibraryChoice();

  private:
    // Window tree (app/config_frame.cpp).
    wxSizer* BuildMainPanel(wxWindow* parent, bool callFit, bool setSizer);
    wxSizer* BuildTreePane(wxWindow* parent, bool callFit, bool setSizer);
    wxSizer* BuildPageHostPane(wxWindow* parent, bool callFit, bool setSizer);
    wxSizer* BuildWelcomePage(wxWindow* parent, bool callFit, bool setSizer);

    // Command bar (app/command_bar.cpp).
    void CreateCommandBar();
    void BuildCommandBar(wxToolBar* toolBar);

    // Generate and close (app/generate_close.cpp).
    void OnQuit(wxCommandEvent& event);
    void OnCloseWindow(wxCloseEvent& event);
    void OnGenerate(wxCommandEvent& event);

    // File commands (config/file_commands.cpp).
    void OnNewConfig(wxCommandEvent& event);
    void OnOpenConfig(wxCommandEvent& event);
    void OnSaveConfig(wxCommandEvent& event);
    void OnSaveConfigAs(wxCommandEvent& event);
    bool MaySetConfigAside();

    // Option tree (tree/option_tree.cpp).
    void BuildNetlistBranch(wxTreeCtrl* tree, const wxTreeItemId& parent);
    void BuildPatternBranch(wxTreeCtrl* tree, const wxTreeItemId& parent);
    void BuildCommonBranch(wxTreeCtrl* tree, const wxTreeItemId& parent);
    void BuildSpiceBranch(wxTreeCtrl* tree, const wxTreeItemId& parent);
    void BuildVerilogBranch(wxTreeCtrl* tree, const wxTreeItemId& parent);
    void BuildVhdlBranch(wxTreeCtrl* tree, const wxTreeItemId& parent);
    void FillLanguageNodes(wxTreeCtrl* tree, const wxTreeItemId& node);
    void FillLibraryPathNodes(wxTreeCtrl* tree, const wxTreeItemId& node);
    void FillTimeScaleNodes(wxTreeCtrl* tree, const wxTreeItemId& node);
    void FillCapacitorNodes(wxTreeCtrl* tree, const wxTreeItemId& node);
    void FillLibraryDefinitionNodes(wxTreeCtrl* tree, const wxTreeItemId& node);

    // Page selection (tree/page_selection.cpp).
    void OnTreeSelChanged(wxTreeEvent& event);
    void LoadPageControls(wxWindow* page, int pageId);
    void LoadLibraryEditor();
    void OnExpandNode(wxCommandEvent& event);
    void OnCollapseNode(wxCommandEvent& event);
    static void ExpandSubtree(wxTreeCtrl* tree, const wxTreeItemId& node);
    static void CollapseSubtree(wxTreeCtrl* tree, const wxTreeItemId& node);
    // The generic tree never stays without a selection: it selects the root in AddRoot, and
    // when the selected node is deleted it selects another at idle time, raising the selection
    // event, which would switch or reload the page. Instead the frame remembers where the
    // selection was and puts it back itself, without the event.
    struct NodeKey
    {
        const wxWindow* page;
        int pageId;
        bool hasData;
        wxString text;

        static NodeKey Of(const wxTreeCtrl* tree, const wxTreeItemId& node);
        bool SameNode(const NodeKey& other) const;
    };
    void KeepSelectionThrough(wxTreeCtrl* tree, const wxTreeItemId& emptied);
    void RestoreLostSelection(wxTreeCtrl* tree);
    void SelectQuietly(wxTreeCtrl* tree, const wxTreeItemId& node);
    void OnInternalIdle() override;
    std::vector<NodeKey> m_lostSelection; // steps from the root to the node that was selected
    bool m_selectionLost = false;
    bool m_quietSelection = false; // set while the frame itself moves the selection

    // Netlist type page (pages/netlist_type_page.cpp).
    wxSizer* BuildNetlistTypePage(wxWindow* parent, bool callFit, bool setSizer);
    void OnAllowSpice(wxCommandEvent& event);
    void OnAllowVerilog(wxCommandEvent& event);
    void OnAllowVhdl(wxCommandEvent& event);
    void RefreshLanguageNodes();
    void OnDefaultLanguage(wxCommandEvent& event);
    void OnFlattenNetlist(wxCommandEvent& event);
    void OnFlattenBusses(wxCommandEvent& event);

    // Pattern and library path page (pages/pattern_page.cpp).
    wxSizer* BuildPatternPage(wxWindow* parent, bool callFit, bool setSizer);
    void OnAddGlobalDirective(wxCommandEvent& event);
    void OnAddDcSources(wxCommandEvent& event);
    void OnLibraryPathSelected(wxCommandEvent& event);
    void OnAddLibraryPath(wxCommandEvent& event);
    void OnAddLibraryFile(wxCommandEvent& event);
    void OnRemoveLibraryPath(wxCommandEvent& event);

    // Common page (pages/common_page.cpp).
    wxSizer* BuildCommonPage(wxWindow* parent, bool callFit, bool setSizer);
    void OnOpenConfigDialog(wxCommandEvent& event);
    void OnBackupNetlist(wxCommandEvent& event);
    void OnBackupExtension(wxCommandEvent& event);
    void OnShowNetlist(wxCommandEvent& event);
    void OnShowPattern(wxCommandEvent& event);
    void OnRunOrvik(wxCommandEvent& event);
    void OnLoadCircuit(wxCommandEvent& event);

    // Spice page (pages/spice_page.cpp).
    wxSizer* BuildSpicePage(wxWindow* parent, bool callFit, bool setSizer);
    void OnSpiceAddPrefix(wxCommandEvent& event);
    void OnSpiceAddUnit(wxCommandEvent& event);
    void OnSpiceAddMosFactor(wxCommandEvent& event);

    // Verilog options page (pages/verilog_options_page.cpp).
    void OnVerilogConnectivity(wxCommandEvent& event);
    void OnVerilogCase(wxCommandEvent& event);
    void OnVerilogGlobalNet(wxCommandEvent& event);
    void OnVerilogSupply1(wxCommandEvent& event);
    void OnVerilogSupply0(wxCommandEvent& event);

    // Verilog directives page (pages/verilog_directives_page.cpp).
    void OnTimescaleDefine(wxCommandEvent& event);
    void OnTimescaleUnit(wxCommandEvent& event);
    void OnTimescalePrecision(wxCommandEvent& event);
    void OnCapacitorDefine(wxCommandEvent& event);
    void OnCapacitorScale(wxCommandEvent& event);
    void OnCapacitorDelay(wxCommandEvent& event);

    // VHDL options page (pages/vhdl_options_page.cpp).
    void OnNetType(wxCommandEvent& event);
    void OnBusType(wxCommandEvent& event);
    void OnArchitectureName(wxCommandEvent& event);
    void OnConfigurationPrefix(wxCommandEvent& event);
    void OnActiveLibrary(wxCommandEvent& event);

    // VHDL library definitions page (pages/library_definitions_page.cpp).
    void ResetLibraryEditor();
    void OnLibraryCellChange(wxGridEvent& event);
    void OnSaveLibraryDefinition(wxCommandEvent& event);
    void OnRemoveLibraryDefinition(wxCommandEvent& event);

    std::unique_ptr<ConfigRecord> m_config; // never null once the windows exist
    wxFlexGridSizer* m_pageSizer = nullptr; // owned by the page host

    wxDECLARE_EVENT_TABLE();
};
